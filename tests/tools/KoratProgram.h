#pragma once

#include "ServiceProbe.h"

#include <gtest/gtest.h>

#include <QRegularExpression>

namespace orvex::test {

// koratd, ready to serve.
class KoratProgram : public Program {
public:
    explicit KoratProgram(const ProgramFolder& folder, const QStringList& arguments = {})
        : Program(folder, KORATD_PATH, arguments)
    {
        EXPECT_TRUE(waitForService(folder, *this));
    }

    // Ends it. What it says that it has sent to all its clients; -1 when it did not end well.
    long long terminateAndCount()
    {
        EXPECT_EQ(terminate(), 0) << errors();
        const QRegularExpression line("^koratd: sent (\\d+) messages$", QRegularExpression::MultilineOption);
        const auto match = line.match(QString::fromStdString(errors()));
        return match.hasMatch() ? match.captured(1).toLongLong() : -1;
    }
};

} // namespace orvex::test
