#pragma once

#include "Array.h"
#include "RunLoop.h"
#include "Screen.h"
#include "TableList.h"

#include <functional>
#include <memory>
#include <string>
#include <utility>

class QLineEdit;

namespace orvex {

namespace Ui {
class OrvexSaveViewController;
}

// Saves a snapshot: lists its contents, as they were when the screen opened, takes a description and writes
// the file. Layout and connections of the buttons are in resources/OrvexSaveViewController.ui.
class OrvexSaveViewController final : public Screen, public TableList::DataSource {
public:
    // `saveHistory` holds the generator's entries, each a dictionary with a "Description"; null counts as
    // empty. Save and Cancel call `close`, which must not delete the screen at once. The clock outlives the
    // screen.
    OrvexSaveViewController(const ArrayRef& saveHistory, const Clock& clock, std::string reportDirectory,
        std::function<void()> close);
    ~OrvexSaveViewController() override;

    // Called with the path of a snapshot that was written, before the screen closes.
    void setSavedHandler(std::function<void(const std::string& path)> handler)
    {
        _saved = std::move(handler);
    }

    TableList& saveContentTable() const;
    QLineEdit& saveDescription() const;
    QWidget& firstResponder() override;

    // Writes the snapshot and closes the screen. If the file cannot be written, logs that and shows an alert,
    // which stays.
    void savePressed();
    void cancelPressed() { _close(); }
    // Takes the focus from the description.
    void backgroundTouched();

    int numberOfRows(const TableList& list) const override;
    std::unique_ptr<TableCell> cellForRow(TableList& list, int row) override;
    // Just a touch beside the field: entries cannot be chosen.
    void didSelectRow(TableList& list, std::optional<int> row) override;

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    std::string descriptionAt(int row) const;

    const Clock& _clock;
    std::string _reportDirectory;
    std::function<void()> _close;
    std::function<void(const std::string& path)> _saved;
    Date _timeStamp; // when the screen was opened
    ArrayRef _saveHistory;
    std::unique_ptr<Ui::OrvexSaveViewController> _ui;
};

} // namespace orvex
