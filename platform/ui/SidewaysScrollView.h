#pragma once

#include <QWidget>

namespace orvex {

// A view that shows part of a broader content. It takes no input: its table scrolls it.
class SidewaysScrollView final : public QWidget {
public:
    explicit SidewaysScrollView(QWidget* parent);

    // The parent of what is scrolled.
    QWidget* content() const { return _content; }
    QSize contentSize() const { return _content->size(); }
    void setContentSize(const QSize& size);

    int offset() const { return _offset; }
    int maximumOffset() const { return qMax(0, _content->width() - width()); }
    // Whether something stands to the right of what is seen.
    bool hidesContentAtRight() const;
    // Kept within the content. The overshoot is how far a finger has pulled beyond the end, for show only.
    void setOffset(int offset, int overshoot = 0);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QWidget* _content;
    int _offset = 0;
};

} // namespace orvex
