#include "StatusPrinter.h"

#include "OrvexApp.h"
#include "OrvexPaneController.h"

#include <QCoreApplication>
#include <QEvent>

namespace orvex {

StatusPrinter::StatusPrinter(const OrvexApp& app, ConsoleOutput& output)
    : _app(app)
    , _output(output)
{
    QCoreApplication::instance()->installEventFilter(this);
}

StatusPrinter::~StatusPrinter()
{
    QCoreApplication::instance()->removeEventFilter(this);
}

bool StatusPrinter::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() != QEvent::Paint || !_app.navigationStack() || !_app.model())
        return false;
    const auto& screen = static_cast<OrvexPaneController&>(_app.navigationStack()->topScreen());
    const QLabel* const label = screen.statusLabel();
    // Labels that dissolve are drawn as well.
    if (watched != label || label->text() == _last)
        return false;
    _last = label->text();
    _output.write(std::to_string(_app.model()->decodedMessages()) + ' ' + _last.toStdString() + '\n');
    return false;
}

} // namespace orvex
