#pragma once

#include "Array.h"
#include "RunLoop.h"
#include "Screen.h"
#include "TableList.h"

#include <functional>
#include <memory>
#include <string>

class QLineEdit;

namespace orvex {

namespace Ui {
class OrvexSaveViewController;
}

// Saves a snapshot: lists what it will hold, takes the user's words about it and writes the file. What it
// saves is what there was when the screen was opened. Its layout is resources/OrvexSaveViewController.ui,
// which also says which of the actions below belongs to which button.
class OrvexSaveViewController final : public Screen, public TableList::DataSource {
public:
    // `saveHistory` is what the session's generator gives to keep, a dictionary with a "Description" each;
    // null is taken for none. `close` is called by Save and Cancel; it may not delete the screen at once. The
    // clock outlives the screen.
    OrvexSaveViewController(const ArrayRef& saveHistory, const Clock& clock, std::string reportDirectory,
        std::function<void()> close);
    ~OrvexSaveViewController() override;

    TableList& saveContentTable() const;
    QLineEdit& saveDescription() const;
    QWidget& firstResponder() override;

    // Writes the snapshot and closes the screen, also when the file could not be written: then with a line in
    // the system log and an alert that stays.
    void savePressed();
    void cancelPressed() { _close(); }
    // Takes the keyboard away from the description.
    void backgroundTouched();

    int numberOfRows(const TableList& list) const override;
    std::unique_ptr<TableCell> cellForRow(TableList& list, int row) override;
    // A touch beside the field; what will be saved cannot be chosen.
    void didSelectRow(TableList& list, std::optional<int> row) override;

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    std::string descriptionAt(int row) const;

    const Clock& _clock;
    std::string _reportDirectory;
    std::function<void()> _close;
    Date _timeStamp; // when the screen was opened
    ArrayRef _saveHistory;
    std::unique_ptr<Ui::OrvexSaveViewController> _ui;
};

} // namespace orvex
