#include "OrvexSaveViewController.h"

#include "SaveHistoryContentCell.h"

#include "Alert.h"
#include "Snapshot.h"
#include "SystemLog.h"
#include "TextLabel.h"
#include "Theme.h"

#include <QKeyEvent>

#include <ui_OrvexSaveViewController.h>

namespace orvex {

namespace {
constexpr const char* kSaveCellIdentifier = "SaveHistoryContentCell";
constexpr int kTitleFontSize = 17;
constexpr int kTitleRoom = 150;
constexpr int kCaptionFontSize = 13;
} // namespace

OrvexSaveViewController::OrvexSaveViewController(
    const ArrayRef& saveHistory, const Clock& clock, std::string reportDirectory, std::function<void()> close)
    : _clock(clock)
    , _reportDirectory(std::move(reportDirectory))
    , _close(std::move(close))
    , _timeStamp(clock.now())
    // A deep copy: sections go on changing while the screen is open.
    , _saveHistory(saveHistory ? Value(saveHistory).deepCopy().array() : Array::make())
    , _ui(std::make_unique<Ui::OrvexSaveViewController>())
{
    _ui->setupUi(this);
    // Between buttons that grow with the desktop's font.
    _ui->titleLabel->setFont(fittedFont(
        Theme::boldSystemFont(kTitleFontSize), _ui->titleLabel->text(), kTitleRoom, kTitleFontSize));
    _ui->caption->setFont(Theme::systemFont(kCaptionFontSize));
    setTitle(_ui->titleLabel->text());
    _ui->saveContentTable->setDataSource(*this);
}

OrvexSaveViewController::~OrvexSaveViewController() = default;

TableList& OrvexSaveViewController::saveContentTable() const
{
    return *_ui->saveContentTable;
}

QLineEdit& OrvexSaveViewController::saveDescription() const
{
    return *_ui->saveDescription;
}

QWidget& OrvexSaveViewController::firstResponder()
{
    return saveDescription();
}

void OrvexSaveViewController::savePressed()
{
    const Snapshot snapshot{dateText(_timeStamp), _saveHistory, saveDescription().text().toStdString()};
    const std::string path = snapshotPath(_reportDirectory, _clock.now());
    if (_reportDirectory.empty() || !writeSnapshot(snapshot, path).empty()) {
        systemLog(Priority::error, "Unable to write snapshot to %s", path.c_str());
        Alert::show(*this, QStringLiteral("File Error"), QStringLiteral("Unable to write file to disk"),
            QStringLiteral("Close"));
    } else if (_saved) {
        _saved(path);
    }
    _close();
}

void OrvexSaveViewController::backgroundTouched()
{
    if (saveDescription().hasFocus())
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
    std::unique_ptr<TableCell> reused = list.dequeueReusableCell(kSaveCellIdentifier);
    if (!reused)
        reused = std::make_unique<SaveHistoryContentCell>(kSaveCellIdentifier);
    static_cast<SaveHistoryContentCell&>(*reused).setText(QString::fromStdString(descriptionAt(row)));
    reused->setAccessory(TableCell::Accessory::checkmark);
    return reused;
}

void OrvexSaveViewController::didSelectRow(TableList&, std::optional<int>)
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
