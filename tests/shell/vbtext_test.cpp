// Number text as typed or read from a data file.
#include "shell/vbtext.hpp"

#include <gtest/gtest.h>

namespace arbolex::shell {
namespace {

TEST(ShellNumericTextTest, RecognisesAndConverts) {
    const struct {
        const char *text;
        bool numeric;
        double value;
    } cases[] = {
        {" 12 ", true, 12},  {"-3", true, -3},  {"+4.5", true, 4.5}, {".5", true, 0.5},
        {"-.5", true, -0.5}, {"5.", true, 5},   {"1e3", true, 1000}, {"2.5E-1", true, 0.25},
        {"", false, 0},      {"  ", false, 0},  {".", false, 0},     {"-", false, 0},
        {"1.2.3", false, 0}, {"abc", false, 0}, {"1,5", false, 0},   {"1e", false, 0},
        {"e5", false, 0},    {"- 3", false, 0}, {"12abc", false, 0}};
    for (const auto &c : cases) {
        const QString text = QString::fromLatin1(c.text);
        EXPECT_EQ(isNumeric(text), c.numeric) << '"' << c.text << '"';
        EXPECT_EQ(val(text), c.value) << '"' << c.text << '"';
    }
}

} // namespace
} // namespace arbolex::shell
