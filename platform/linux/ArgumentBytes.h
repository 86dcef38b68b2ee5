#pragma once

#include <QStringList>

#include <string>

namespace orvex {

// For QCommandLineParser, which takes texts, while file names are bytes in any encoding or none: each byte of
// an argument becomes one character, and comes back as it was whatever the locale.
inline QStringList argumentTexts(int count, char** arguments)
{
    QStringList texts;
    for (int i = 0; i < count; ++i)
        texts.append(QString::fromLatin1(arguments[i]));
    return texts;
}

inline std::string argumentBytes(const QString& text)
{
    return text.toLatin1().toStdString();
}

} // namespace orvex
