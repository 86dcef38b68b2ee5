#include "service/Recorder.h"

#include "CaptureReader.h"
#include "TemporaryFile.h"

#include <gtest/gtest.h>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

TEST(Recorder, SaysOnceThatAMessageIsTooLongAndGoesOn)
{
    const test::TemporaryFile file;
    testing::internal::CaptureStderr();
    {
        Recorder recorder(file.path);
        recorder.reportCut();
        for (const std::size_t length : {262'144U, 262'145U, 16U << 20, 5U})
            recorder.write(Bytes(length, 1), 1s);
        recorder.reportCut();
    }
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
        "koratd: a message of 262145 bytes is too long for the recording; only its first 262144 bytes were "
        "written\n"
        "koratd: 2 messages were cut in the recording; a replay skips them\n");
    const auto reader = CaptureReader::open(file.path);
    for (const std::size_t length : {262'144U, 5U}) {
        ASSERT_EQ(reader->next(), CaptureReader::Status::message) << reader->error();
        EXPECT_EQ(reader->message().size(), length);
    }
    EXPECT_EQ(reader->next(), CaptureReader::Status::end) << reader->error();
}

} // namespace
} // namespace orvex::korat
