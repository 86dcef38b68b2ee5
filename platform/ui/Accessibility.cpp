#include "Accessibility.h"

#include "ActivityIndicator.h"
#include "TableCell.h"
#include "TableList.h"
#include "TouchArea.h"

#include <QAccessible>
#include <QAccessibleWidget>

namespace orvex {

namespace {
QAccessibleInterface* interfaceFor(const QString&, QObject* object)
{
    // Qt takes over what is returned.
    if (auto* const list = dynamic_cast<TableList*>(object))
        return new QAccessibleWidget(list, QAccessible::List);
    if (auto* const cell = dynamic_cast<TableCell*>(object))
        return new QAccessibleWidget(cell, QAccessible::ListItem);
    if (auto* const indicator = dynamic_cast<ActivityIndicator*>(object))
        return new QAccessibleWidget(indicator, QAccessible::Indicator);
    if (auto* const area = dynamic_cast<TouchArea*>(object))
        return new QAccessibleWidget(area, QAccessible::Pane);
    return nullptr;
}
} // namespace

void installAccessibility()
{
    QAccessible::installFactory(interfaceFor);
}

} // namespace orvex
