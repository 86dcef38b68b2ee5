#include "WorkerPool.h"

#include <gtest/gtest.h>

#include <atomic>
#include <csignal>
#include <new>
#include <thread>
#include <vector>

#include <sys/mman.h>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

// Numbers that workers and the test share.
struct Shared {
    std::atomic<int> atWork = 0;
    std::atomic<int> mostAtWork = 0;
};

class WorkerPoolTest : public testing::Test {
protected:
    // Performs so many pieces, and notes when each is prepared and reported.
    void run(std::size_t workers, std::size_t count, std::function<int(std::size_t)> perform)
    {
        WorkerPool(workers).run({count,
            [this](std::size_t) {
                ++prepared;
                longestLead = std::max(longestLead, prepared - reported.size());
            },
            std::move(perform),
            [this](std::size_t piece, const WorkerPool::End& end) {
                reported.push_back(piece);
                ends.push_back(end);
            }});
    }

    Shared& shared = *new (
        mmap(nullptr, sizeof(Shared), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0)) Shared;
    std::size_t prepared = 0;
    std::size_t longestLead = 0;
    std::vector<std::size_t> reported;
    std::vector<WorkerPool::End> ends;
};

TEST_F(WorkerPoolTest, ReportsInOrderWhateverIsDoneFirst)
{
    run(3, 6, [this](std::size_t piece) {
        const int atWork = ++shared.atWork;
        int most = shared.mostAtWork;
        while (most < atWork && !shared.mostAtWork.compare_exchange_weak(most, atWork)) { }
        std::this_thread::sleep_for(piece == 0 ? 200ms : 20ms);
        --shared.atWork;
        return 0;
    });
    EXPECT_EQ(reported, (std::vector<std::size_t>{0, 1, 2, 3, 4, 5}));
    EXPECT_EQ(shared.mostAtWork, 3);
}

TEST_F(WorkerPoolTest, AWorkerThatDiesTakesNothingWithIt)
{
    run(2, 4, [](std::size_t piece) {
        if (piece == 1)
            std::raise(SIGKILL);
        return piece == 2 ? 5 : 0;
    });
    ASSERT_EQ(ends.size(), 4U);
    EXPECT_TRUE(ends[0].isGood);
    EXPECT_FALSE(ends[1].isGood);
    EXPECT_EQ(ends[1].death, "ended by signal 9 (Killed)");
    EXPECT_FALSE(ends[2].isGood);
    EXPECT_EQ(ends[2].death, "");
    EXPECT_TRUE(ends[3].isGood);
}

TEST_F(WorkerPoolTest, StaysNearTheOldestPiece)
{
    run(2, 100, [](std::size_t piece) {
        std::this_thread::sleep_for(piece == 0 ? 300ms : 0ms);
        return 0;
    });
    EXPECT_EQ(reported.size(), 100U);
    EXPECT_LE(longestLead, 32U) << "files are open for each of them";
}

} // namespace
} // namespace orvex::test
