#include "UpdateMessage.h"

#include <QDateTime>

#include <cmath>

namespace orvex {

std::string updateMessageAt(Date moment)
{
    const auto seconds = static_cast<qint64>(std::floor(moment.secondsSince1970));
    return QDateTime::fromSecsSinceEpoch(seconds)
        .toString(QStringLiteral("'Updated' yyyy-MM-dd 'at' HH:mm:ss"))
        .toStdString();
}

} // namespace orvex
