// The rows of an estate without the files: the first line names the columns,
// every later line is a row; each is read, checked, grown, valued and made
// into its results line in every format, as the estate command does. Fields
// are split at commas, or at semicolons when the header has one (and then a
// number may have a decimal comma): the fuzzer reaches the row reader, not a
// CSV parser.
#include "estate/forecast.hpp"
#include "estate/resulttable.hpp"
#include "estate/rowevaluator.hpp"
#include "estate/tablefile.hpp"

#include <algorithm>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

using namespace arbolex;

namespace {

std::vector<std::string> fields(std::string_view line, char separator) {
    std::vector<std::string> out(1);
    for (const char c : line) {
        if (c == separator) {
            out.emplace_back();
        } else {
            out.back().push_back(c);
        }
    }
    return out;
}

/// Rows grown per input at most: enough to mix models and regimes, few
/// enough that every run stays fast.
constexpr int kMostRows = 16;

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char *>(data), size);
    std::vector<std::string_view> lines;
    for (std::size_t start = 0; start <= text.size();) {
        const std::size_t end = std::min(text.find('\n', start), text.size());
        lines.push_back(text.substr(start, end - start));
        start = end + 1;
    }
    const char separator = lines.front().find(';') != std::string_view::npos ? ';' : ',';
    std::string problem;
    auto layout = estate::layoutOf(fields(lines.front(), separator), problem);
    if (!layout) {
        return 0;
    }
    layout->decimalComma = separator == ';';
    std::vector<estate::RowFormat> formats;
    for (const auto format :
         {estate::TableFormat::kCsv, estate::TableFormat::kTsv, estate::TableFormat::kJson}) {
        formats.emplace_back(format, estate::resultColumns(*layout));
    }
    estate::EstateDefaults defaults;
    defaults.regime = {20, 5, 40.0f, std::nullopt};
    // Prices do not matter here: every harvest is valued at nothing.
    defaults.economics.ratePercent = 3.0;
    defaults.year = 2026;
    estate::RowEvaluator evaluator(*layout, defaults);
    estate::Forecast forecast;
    std::vector<std::string> values;
    for (std::size_t i = 1; i < lines.size() && i <= kMostRows; ++i) {
        const estate::RowValues row = fields(lines[i], separator);
        const estate::RowResult result = evaluator.evaluate(row);
        estate::resultValues(*layout, static_cast<long long>(i) + 1, row, result, values);
        for (const estate::RowFormat &format : formats) {
            (void)format.line(values);
        }
        forecast.add(result);
    }
    for (const estate::Forecast::Line &line : forecast.lines(2026)) {
        (void)estate::forecastValues(line);
    }
    return 0;
}
