#include "AppPlatform.h"

#include <QDateTime>
#include <QLocale>

#include <cmath>

namespace orvex {

namespace {

constexpr const char* kHomeScreenDomain = "org.orvex.HomeScreen";
constexpr const char* kShowGSMRSSI = "HXShowGSMRSSI";

} // namespace

std::string updateMessageAt(Date moment)
{
    const auto seconds = static_cast<qint64>(std::floor(moment.secondsSince1970));
    return QLocale()
        .toString(
            QDateTime::fromSecsSinceEpoch(seconds), QStringLiteral("'Updated' yyyy-MM-dd 'at' HH:mm:ss"))
        .toStdString();
}

void setGSMRSSIPreference(Preferences& preferences, bool shown)
{
    preferences.setValue(kHomeScreenDomain, kShowGSMRSSI, shown);
    preferences.synchronize(kHomeScreenDomain);
    preferences.postChanged(kHomeScreenDomain, kShowGSMRSSI);
}

} // namespace orvex
