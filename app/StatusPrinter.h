#pragma once

#include "ConsoleOutput.h"

#include <QObject>

namespace orvex {

class OrvexApp;

// Writes what the status line in the application's window says, whenever it is drawn with another text, after
// the number of messages decoded by then: "1234 Updated 2024-03-05 at 14:07:09". For programs that watch over
// a session.
class StatusPrinter final : public QObject {
public:
    // Both outlive the printer.
    StatusPrinter(const OrvexApp& app, ConsoleOutput& output);
    ~StatusPrinter() override;

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    const OrvexApp& _app;
    ConsoleOutput& _output;
    QString _last;
};

} // namespace orvex
