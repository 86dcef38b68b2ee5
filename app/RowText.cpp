#include "RowText.h"

#include "VisibleText.h"

namespace orvex {

QString rowText(const OrvexModelNode& node)
{
    std::string text = visibleText(node.displayName());
    if (const std::string* value = node.value())
        text += '\t' + visibleText(*value);
    return QString::fromStdString(text);
}

QString screenText(const OrvexModelNode* node)
{
    QString text;
    if (const auto* const children = node ? node->childNodes() : nullptr) {
        for (const OrvexModelNodeRef& child : *children)
            text += rowText(*child) + QLatin1Char('\n');
    }
    return text;
}

} // namespace orvex
