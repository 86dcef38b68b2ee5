#pragma once

#include <QObject>

#include <functional>
#include <string>

class QWidget;

namespace orvex {

// Accepts files dropped on a window.
class FileDrop final : public QObject {
public:
    // Calls back with each file's path. The window owns the object.
    FileDrop(QWidget& window, std::function<void(const std::string& path)> onFile);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    std::function<void(const std::string& path)> _onFile;
};

// Opens the file in a process of its own, so that a hostile file cannot end this session. It looks like this
// window and reports a file that it cannot show. False if the process cannot be started.
bool openInAnotherProcess(const std::string& path, const QWidget& window);

} // namespace orvex
