#pragma once

#include <QBasicTimer>
#include <QStaticText>
#include <QString>
#include <QWidget>

namespace orvex {

// A message on a card above the toolbar that disappears after a few seconds. It takes no input. A new notice
// replaces the old one.
class Notice final : public QWidget {
public:
    // The notice deletes itself.
    static Notice& show(QWidget& window, const QString& text);

    const QString& text() const { return _text; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    Notice(QWidget& window, const QString& text);

    void place();

    QString _text;
    QStaticText _lines; // as the width breaks the text
    QBasicTimer _shown;
};

} // namespace orvex
