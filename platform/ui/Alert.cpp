#include "Alert.h"

#include <QMessageBox>

namespace orvex {

void showAlert(QWidget& over, const QString& title, const QString& message, const QString& button)
{
    auto* const box = new QMessageBox(over.window());
    box->setAttribute(Qt::WA_DeleteOnClose);
    box->setWindowTitle(title);
    // The title stands in the box too: on a handset there is no frame to show it in.
    box->setText(title);
    box->setInformativeText(message);
    box->setTextFormat(Qt::PlainText);
    box->addButton(button, QMessageBox::AcceptRole);
    box->open();
}

} // namespace orvex
