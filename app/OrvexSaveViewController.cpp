#include "OrvexSaveViewController.h"

#include "SaveHistoryContentCell.h"

#include "Alert.h"
#include "BarButton.h"
#include "NavigationBar.h"
#include "Snapshot.h"
#include "SystemLog.h"
#include "TextLabel.h"
#include "Theme.h"

#include <QKeyEvent>
#include <QLineEdit>
#include <QPainter>

namespace orvex {

namespace {

constexpr const char* kCellIdentifier = "SaveHistoryContentCell";
constexpr int kBarHeight = NavigationBar::kHeight;
constexpr int kMargin = 10;
constexpr int kFieldHeight = 36;
constexpr int kFieldFontSize = 15;
constexpr int kFieldTextMargin = 6;
constexpr int kCaptionHeight = 24;
constexpr int kCaptionFontSize = 13;

// In the middle of a band of the screen, from one side or the other.
void placeButton(BarButton& button, int left, int bandHeight)
{
    button.resize(button.sizeHint());
    button.move(left, (bandHeight - button.height()) / 2);
}

} // namespace

OrvexSaveViewController::OrvexSaveViewController(
    const ArrayRef& saveHistory, const Clock& clock, std::string reportDirectory, std::function<void()> close)
    : _clock(clock)
    , _reportDirectory(std::move(reportDirectory))
    , _close(std::move(close))
    , _timeStamp(clock.now())
    // All the way down: sections go on changing while the screen is open.
    , _saveHistory(saveHistory ? Value(saveHistory).deepCopy().array() : Array::make())
    , _cancelButton(new BarButton(BarButton::Style::plain, QStringLiteral("Cancel"), this))
    , _saveButton(new BarButton(BarButton::Style::plain, QStringLiteral("Save"), this))
    , _titleLabel(new TextLabel(Theme::boldSystemFont(17), this))
    , _saveDescription(new QLineEdit(this))
    , _caption(new TextLabel(Theme::systemFont(kCaptionFontSize), this))
    , _saveContentTable(new TableList(*this, this))
{
    setTitle(QStringLiteral("Save Snapshot"));
    _titleLabel->setLine(title());
    _caption->setLine(QStringLiteral("Will be saved:"));
    _saveDescription->setFont(Theme::systemFont(kFieldFontSize));
    QPalette palette = _saveDescription->palette();
    palette.setColor(QPalette::Base, Theme::current().bar);
    _saveDescription->setPalette(palette);
    _saveDescription->setTextMargins(kFieldTextMargin, 0, kFieldTextMargin, 0);
    _saveDescription->setPlaceholderText(QStringLiteral("Description"));
    _saveDescription->setAccessibleName(QStringLiteral("Description"));
    setTabOrder(_saveDescription, _saveButton);
    connect(_cancelButton, &BarButton::clicked, this, &OrvexSaveViewController::cancelPressed);
    connect(_saveButton, &BarButton::clicked, this, &OrvexSaveViewController::savePressed);
    connect(_saveDescription, &QLineEdit::returnPressed, this, &OrvexSaveViewController::backgroundTouched);
    _saveContentTable->setAccessibleName(QStringLiteral("Contents of the snapshot"));
    _saveContentTable->reloadData();
}

void OrvexSaveViewController::savePressed()
{
    const Snapshot snapshot{dateText(_timeStamp), _saveHistory, _saveDescription->text().toStdString()};
    const std::string path = snapshotPath(_reportDirectory, _clock.now());
    if (!writeSnapshot(snapshot, path)) {
        systemLog(Priority::error, "Unable to write snapshot to %s", path.c_str());
        Alert::show(*this, QStringLiteral("File Error"), QStringLiteral("Unable to write file to disk"),
            QStringLiteral("Close"));
    }
    _close();
}

void OrvexSaveViewController::backgroundTouched()
{
    if (_saveDescription->hasFocus())
        setFocus();
}

std::string OrvexSaveViewController::descriptionAt(int row) const
{
    const DictionaryRef item = (*_saveHistory)[static_cast<std::size_t>(row)].dictionary();
    const std::string* description = item ? (*item)["Description"].string() : nullptr;
    return description ? *description : std::string();
}

int OrvexSaveViewController::numberOfRows(const TableList&) const
{
    return static_cast<int>(_saveHistory->size());
}

std::unique_ptr<TableCell> OrvexSaveViewController::cellForRow(TableList& list, int row)
{
    std::unique_ptr<TableCell> reused = list.dequeueReusableCell(kCellIdentifier);
    if (!reused)
        reused = std::make_unique<SaveHistoryContentCell>(kCellIdentifier);
    static_cast<SaveHistoryContentCell&>(*reused).setText(QString::fromStdString(descriptionAt(row)));
    reused->setAccessory(TableCell::Accessory::checkmark);
    return reused;
}

void OrvexSaveViewController::didSelectRow(TableList& list, std::optional<int>)
{
    list.deselectRow();
    backgroundTouched();
}

void OrvexSaveViewController::resizeEvent(QResizeEvent*)
{
    placeButton(*_cancelButton, 0, kBarHeight);
    placeButton(*_saveButton, width() - _saveButton->sizeHint().width(), kBarHeight);
    const int titleWidth = sizeOfLine(title(), _titleLabel->font()).width();
    _titleLabel->setGeometry((width() - titleWidth) / 2, 0, titleWidth, kBarHeight - 1);
    int top = kBarHeight + kMargin;
    _saveDescription->setGeometry(kMargin, top, width() - 2 * kMargin, kFieldHeight);
    top += kFieldHeight + kMargin;
    _caption->setGeometry(kMargin, top, width() - 2 * kMargin, kCaptionHeight);
    top += kCaptionHeight;
    const int fitting = numberOfRows(*_saveContentTable) * _saveContentTable->rowHeight();
    _saveContentTable->setGeometry(0, top, width(), std::min(fitting, std::max(0, height() - top)));
}

void OrvexSaveViewController::paintEvent(QPaintEvent* event)
{
    Screen::paintEvent(event);
    QPainter painter(this);
    painter.fillRect(QRect(0, 0, width(), kBarHeight), Theme::current().bar);
    painter.fillRect(QRect(0, kBarHeight - 1, width(), 1), Theme::current().barSeparator);
}

void OrvexSaveViewController::mousePressEvent(QMouseEvent*)
{
    backgroundTouched();
}

void OrvexSaveViewController::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape)
        cancelPressed();
    else
        Screen::keyPressEvent(event);
}

} // namespace orvex
