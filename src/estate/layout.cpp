#include "estate/layout.hpp"

#include <algorithm>
#include <cctype>

namespace arbolex::estate {

namespace {

/// Longest field name a Shapefile keeps.
constexpr std::size_t kShapefileNameLength = 10;

bool sameName(std::string_view typed, std::string_view known) {
    auto equal = [](std::string_view a, std::string_view b) {
        return std::equal(a.begin(), a.end(), b.begin(), b.end(), [](char x, char y) {
            return std::tolower(static_cast<unsigned char>(x)) ==
                   std::tolower(static_cast<unsigned char>(y));
        });
    };
    return equal(typed, known) ||
           (typed.size() == kShapefileNameLength && known.size() > kShapefileNameLength &&
            equal(typed, known.substr(0, kShapefileNameLength)));
}

} // namespace

std::optional<Layout> layoutOf(const std::vector<std::string> &names, std::string &problem) {
    Layout layout;
    layout.index.fill(-1);
    for (std::size_t i = 0; i < names.size(); ++i) {
        const auto known = std::find_if(kColumnNames.begin(), kColumnNames.end(),
                                        [&](std::string_view k) { return sameName(names[i], k); });
        if (known == kColumnNames.end()) {
            layout.carried.push_back(static_cast<int>(i));
            layout.carriedNames.push_back(names[i]);
            continue;
        }
        int &slot = layout.index[static_cast<std::size_t>(known - kColumnNames.begin())];
        if (slot >= 0) {
            problem = "the column \"" + std::string(*known) + "\" is given twice";
            return std::nullopt;
        }
        slot = static_cast<int>(i);
    }
    for (const Column c : {Column::kId, Column::kModel, Column::kAge, Column::kStocking,
                           Column::kTopHeight, Column::kAreaHa}) {
        if (!layout.has(c)) {
            problem = "the input has no column \"" +
                      std::string(kColumnNames[static_cast<std::size_t>(c)]) + "\"";
            return std::nullopt;
        }
    }
    if (!layout.has(Column::kBasalArea) && !layout.has(Column::kDbh)) {
        problem = R"(the input has neither a column "basal_area" nor "dbh")";
        return std::nullopt;
    }
    return layout;
}

} // namespace arbolex::estate
