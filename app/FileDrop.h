#pragma once

#include <QObject>

#include <functional>
#include <string>

class QWidget;

namespace orvex {

// Takes files that are dropped on a window.
class FileDrop final : public QObject {
public:
    // Calls back for every file, with its path. The window owns the object.
    FileDrop(QWidget& window, std::function<void(const std::string& path)> onFile);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    std::function<void(const std::string& path)> _onFile;
};

// Shows the file in a process of its own, so that a hostile one cannot end this session. Returns false when
// that cannot be started.
bool openInAnotherProcess(const std::string& path, const QWidget& window);

} // namespace orvex
