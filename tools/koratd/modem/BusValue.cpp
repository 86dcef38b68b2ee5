#include "modem/BusValue.h"

#include "Array.h"
#include "Dictionary.h"

#include <QDBusArgument>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QStringList>

namespace orvex::korat {

namespace {
Value valueFromArgument(const QDBusArgument& argument);

// Of an array or a structure that was begun.
Value elementsOf(const QDBusArgument& argument)
{
    auto result = Array::make();
    while (!argument.atEnd())
        result->append(valueFromArgument(argument));
    return result;
}

Value valueFromMap(const QDBusArgument& argument)
{
    auto result = Dictionary::make();
    argument.beginMap();
    while (!argument.atEnd()) {
        argument.beginMapEntry();
        const Value key = valueFromArgument(argument);
        Value value = valueFromArgument(argument);
        if (const auto* name = key.string())
            result->set(*name, std::move(value));
        else if (const auto* number = key.integer())
            result->set(std::to_string(*number), std::move(value));
        argument.endMapEntry();
    }
    argument.endMap();
    return result;
}

// Reading moves the argument on, though it is const.
Value valueFromArgument(const QDBusArgument& argument)
{
    Value result;
    switch (argument.currentType()) {
    case QDBusArgument::ArrayType:
        argument.beginArray();
        result = elementsOf(argument);
        argument.endArray();
        break;
    case QDBusArgument::StructureType:
        argument.beginStructure();
        result = elementsOf(argument);
        argument.endStructure();
        break;
    case QDBusArgument::MapType: result = valueFromMap(argument); break;
    default: result = valueFromBus(argument.asVariant());
    }
    return result;
}

Value valueFromList(const QStringList& list)
{
    auto result = Array::make();
    for (const QString& text : list)
        result->append(text.toStdString());
    return result;
}

Value numberFrom(const QVariant& variant)
{
    bool isNumber = false;
    const qlonglong number = variant.toLongLong(&isNumber);
    return isNumber ? Value(static_cast<std::int64_t>(number)) : Value();
}
} // namespace

Value valueFromBus(const QVariant& variant)
{
    if (variant.userType() == qMetaTypeId<QDBusVariant>())
        return valueFromBus(variant.value<QDBusVariant>().variant());
    if (variant.userType() == qMetaTypeId<QDBusObjectPath>())
        return variant.value<QDBusObjectPath>().path().toStdString();
    if (variant.userType() == qMetaTypeId<QDBusArgument>())
        return valueFromArgument(variant.value<QDBusArgument>());
    switch (variant.userType()) {
    case QMetaType::Bool: return variant.toBool();
    case QMetaType::Double: return variant.toDouble();
    case QMetaType::QString: return variant.toString().toStdString();
    case QMetaType::QStringList: return valueFromList(variant.toStringList());
    default: return numberFrom(variant);
    }
}

} // namespace orvex::korat
