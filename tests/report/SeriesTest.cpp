#include "Series.h"
#include "Band.h"
#include "LevelStatistics.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>

namespace orvex::test {
namespace {

using Point = Series::Point;

// The value at a position; none before the first point.
std::optional<double> valueAt(const std::vector<Point>& points, std::int64_t position)
{
    const auto after = std::ranges::upper_bound(points, position, {}, &Point::position);
    return after == points.begin() ? std::nullopt : std::prev(after)->number;
}

TEST(Series, KeepsUpToTheLimitAsItIs)
{
    Series series;
    series.add(5, std::nullopt); // absent from the start
    for (std::size_t i = 0; i < Series::kLimit; ++i)
        series.add(static_cast<std::int64_t>(10 + i), static_cast<double>(i));
    series.finish();
    EXPECT_EQ(series.bucket(), 0);
    ASSERT_EQ(series.points().size(), Series::kLimit);
    EXPECT_TRUE(series.points().front() == (Point{10, 0}));
}

TEST(Series, ThinsALongerOneAndKeepsItsPeaks)
{
    Series series;
    std::vector<Point> all;
    for (std::int64_t i = 0; i < 130'000; ++i) {
        std::optional<double> number(static_cast<double>(i * 7919 % 100));
        if (i == 40'001)
            number = 500;
        else if (i == 77'777)
            number = -500;
        else if (i >= 90'000 && i < 91'000)
            number.reset();
        series.add(2000 * i, number);
        all.push_back({2000 * i, number});
        ASSERT_LE(series.points().size(), Series::kLimit) << i;
    }
    series.finish(5'000);
    EXPECT_LE(series.points().size(), 5'000);
    const std::vector<Point>& kept = series.points();
    EXPECT_TRUE(std::ranges::is_sorted(kept, {}, &Point::position));
    for (const Point& point : kept)
        ASSERT_TRUE(all[static_cast<std::size_t>(point.position / 2000)] == point) << point.position;
    for (const Point& wanted : {Point{80'002'000, 500}, Point{155'554'000, -500}})
        EXPECT_NE(std::ranges::find(kept, wanted), kept.end());
    EXPECT_EQ(valueAt(kept, 181'000'000), std::nullopt);
    ASSERT_GT(series.bucket(), 2000);
    for (std::int64_t end = series.bucket() - 1; end < all.back().position; end += series.bucket())
        ASSERT_EQ(valueAt(kept, end), valueAt(all, end)) << end;
}

TEST(Band, ThinsToWhatHeldLongest)
{
    Band band("State", false);
    band.add(0, "start");
    const auto periods = static_cast<std::int64_t>(Band::kLimit);
    for (std::int64_t i = 0; i < periods; ++i) {
        band.add(10'000 * i + 1, i < periods / 4 ? "long" : "idle");
        band.add(10'000 * i + 9'500, "short");
    }
    band.add(10'000 * periods, "end");
    band.finish();
    std::ostringstream stream;
    JsonWriter json(stream);
    json.setCompact(true);
    band.writeJson(json);
    const std::string text = stream.str();
    EXPECT_NE(text.find(R"("texts":["long","idle","end"])"), std::string::npos) << text;
    EXPECT_NE(text.find(",200000000]"), std::string::npos) << text;
}

TEST(LevelStatistics, WeighsValuesByTheirTime)
{
    LevelStatistics statistics;
    statistics.add(-70, 1000);
    statistics.add(-110.25, 500);
    statistics.add(-90.5, 1600);
    EXPECT_EQ(statistics.best(), -70);
    EXPECT_EQ(statistics.worst(), -110.25);
    EXPECT_EQ(statistics.median(), -90.5);
    statistics.add(-70, 1200); // 2200 of 4300 ms now
    EXPECT_EQ(statistics.median(), -70);

    LevelStatistics many;
    for (int i = 0; i < 100'000; ++i)
        many.add(i / 1000.0, 1);
    EXPECT_NEAR(many.median(), 50, 0.1);
    EXPECT_EQ(many.best(), 99.999);
}

} // namespace
} // namespace orvex::test
