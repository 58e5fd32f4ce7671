// The results table writes each figure as printf would ("%.9g" for a stand
// quantity, "%.3f" for a volume, "%.2f" for money), byte for byte: checked
// against printf itself on figures whose digits are hard to get right.
#include "estate/resulttable.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

namespace arbolex::estate {
namespace {

std::string printed(const char *format, double x) {
    char text[400];
    std::snprintf(text, sizeof text, format, x);
    return text;
}

class ResultFigureTest : public ::testing::TestWithParam<double> {};

TEST_P(ResultFigureTest, FiguresAreWrittenAsPrintfWritesThem) {
    const double x = GetParam();
    RowResult row;
    row.areaHa = 1.0;
    row.siteIndex = static_cast<float>(x);
    row.thinningVolume = x;
    row.finalCutVolume = static_cast<float>(x);
    row.maxMai = x;
    row.finalCutMai = x;
    row.npv = x;
    std::vector<std::string> values;
    figureValues(row, values);
    EXPECT_EQ(values[1], printed("%.9g", static_cast<float>(x))); // site_index
    EXPECT_EQ(values[4], printed("%.3f", x));                     // thinning_volume_ha
    EXPECT_EQ(values[8], printed("%.9g", static_cast<float>(x))); // final_cut_volume_ha
    EXPECT_EQ(values[10], printed("%.9g", x));                    // max_mai
    EXPECT_EQ(values[11], printed("%.9g", x));                    // mai_final_cut
    EXPECT_EQ(values[12], printed("%.2f", std::nearbyint(x * 100.0) / 100.0)); // npv_ha
}

INSTANTIATE_TEST_SUITE_P(HardDigits, ResultFigureTest,
                         ::testing::Values(0.0, -0.0, 0.0005, 0.0015, 2.675, 1.005, -1234.5625,
                                           1e-7, 123456789.0, 1.23456789e-5, 3.4e38, 1e21,
                                           0.1 + 0.2, 22.9799121, 1148.99561));

// A volume is written from its scaled value except near a half of its last
// decimal, where only the exact value decides: the halves, the doubles either
// side of them and negative figures that round to zero.
TEST(ResultFigureTest, VolumesNearAHalfAreWrittenAsPrintfWritesThem) {
    std::vector<double> volumes = {0.0625,
                                   0.1875,
                                   2.3125,
                                   -0.0625,
                                   -0.0001,
                                   -0.0004999,
                                   0.00049999999999999,
                                   999999999.9995,
                                   4503599627.3704995};
    for (int k = 0; k < 3000; k += 7) {
        const double half = (k + 0.5) / 1000.0;
        volumes.insert(volumes.end(), {half, std::nextafter(half, 0.0), std::nextafter(half, 1e9),
                                       -half, half * 1000.0, 12345.0 + half});
    }
    for (const double v : volumes) {
        RowResult row;
        row.areaHa = 1.0;
        row.thinningVolume = v;
        std::vector<std::string> values;
        figureValues(row, values);
        EXPECT_EQ(values[4], printed("%.3f", v)) << v;
    }
}

} // namespace
} // namespace arbolex::estate
