#include "WorkerPool.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <new>
#include <thread>
#include <vector>

#include <sys/mman.h>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

TEST(WorkerPool, ReportsInOrderWhateverIsDoneFirstAndStaysNearTheOldestPiece)
{
    constexpr int kWorkers = 3;
    void* const shared =
        mmap(nullptr, sizeof(int), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    auto& atWork = *new (shared) std::atomic<int>(0);
    std::size_t prepared = 0;
    std::size_t longestLead = 0;
    std::vector<std::size_t> reported;
    int timesAllWereAtWork = 0;
    WorkerPool(kWorkers).run(
        {100, [&](std::size_t) { longestLead = std::max(longestLead, ++prepared - reported.size()); },
            [&](std::size_t piece) {
                const int now = ++atWork;
                if (now > kWorkers)
                    std::abort();
                std::this_thread::sleep_for(piece == 0 ? 1000ms : 5ms);
                --atWork;
                return now == kWorkers ? 1 : 0;
            },
            [&](std::size_t piece, const WorkerPool::End& end) {
                reported.push_back(piece);
                EXPECT_EQ(end.death, "");
                timesAllWereAtWork += end.isGood ? 0 : 1;
            }});
    EXPECT_EQ(reported.size(), 100U);
    EXPECT_TRUE(std::ranges::is_sorted(reported));
    EXPECT_GT(timesAllWereAtWork, 0);
    EXPECT_LE(longestLead, 48U) << "files are open for each of them";
}

} // namespace
} // namespace orvex::test
