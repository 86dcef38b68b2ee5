#include "UpdateMessage.h"

#include <QDateTime>
#include <QLocale>

#include <cmath>

namespace orvex {

std::string updateMessageAt(Date moment)
{
    const auto seconds = static_cast<qint64>(std::floor(moment.secondsSince1970));
    return QLocale()
        .toString(
            QDateTime::fromSecsSinceEpoch(seconds), QStringLiteral("'Updated' yyyy-MM-dd 'at' HH:mm:ss"))
        .toStdString();
}

} // namespace orvex
