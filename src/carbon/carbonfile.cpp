#include "carbon/carbonfile.hpp"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <functional>
#include <set>
#include <sstream>
#include <vector>

namespace arbolex::carbon {

namespace {

/// One name of the file: where its value lives, and the comment above it.
struct Entry {
    std::string name;
    std::string comment;
    std::function<std::string(const Settings &)> show;
    /// Sets the value from its text; false when the text is not one.
    std::function<bool(Settings &, std::string_view)> set;
};

std::string number(double x) {
    char buffer[32];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, x);
    return {buffer, result.ptr};
}

bool readNumber(std::string_view text, double &x) {
    const auto result = std::from_chars(text.data(), text.data() + text.size(), x);
    return result.ec == std::errc() && result.ptr == text.data() + text.size() && std::isfinite(x);
}

bool readWhole(std::string_view text, int &x) {
    const auto result = std::from_chars(text.data(), text.data() + text.size(), x);
    return result.ec == std::errc() && result.ptr == text.data() + text.size();
}

Entry real(std::string name, std::string comment, std::function<double &(Settings &)> at) {
    return {std::move(name), std::move(comment),
            [at](const Settings &s) { return number(at(const_cast<Settings &>(s))); },
            [at](Settings &s, std::string_view text) {
                return readNumber(text, at(s));
            }};
}

Entry whole(std::string name, std::string comment, std::function<int &(Settings &)> at) {
    return {std::move(name), std::move(comment),
            [at](const Settings &s) { return std::to_string(at(const_cast<Settings &>(s))); },
            [at](Settings &s, std::string_view text) {
                return readWhole(text, at(s));
            }};
}

Entry yesNo(std::string name, std::string comment, std::function<bool &(Settings &)> at) {
    return {std::move(name), std::move(comment),
            [at](const Settings &s) {
                return std::string(at(const_cast<Settings &>(s)) ? "yes" : "no");
            },
            [at](Settings &s, std::string_view text) {
                if (text != "yes" && text != "no") {
                    return false;
                }
                at(s) = text == "yes";
                return true;
            }};
}

const std::vector<Entry> &entries() {
    static const std::vector<Entry> all = [] {
        std::vector<Entry> e;
        e.push_back(real("price",
                         "Carbon price, EUR per t CO2e. Shipped: Ireland's carbon tax on fossil "
                         "fuels from 1 May 2024 (Finance Act 2020).",
                         [](Settings &s) -> double & { return s.pricing.price; }));
        e.push_back({"payment",
                     "How carbon is paid: none (shown, not counted), flow (paid on each year's "
                     "net removal, charged on each year's release) or units (paid on the units "
                     "issued).",
                     [](const Settings &s) { return std::string(paymentName(s.pricing.payment)); },
                     [](Settings &s, std::string_view text) {
                         return paymentFromName(text, s.pricing.payment);
                     }});
        for (std::size_t i = 0; i < Parameters{}.gravity.size(); ++i) {
            const std::string species(Parameters{}.gravity[i].species);
            e.push_back(
                real("specific_gravity." + species,
                     i == 0 ? "Nominal specific gravity, oven-dry t per m3 of fresh stem "
                              "(Lavers 1983, as tabulated for the Woodland Carbon Code)."
                            : "",
                     [i](Settings &s) -> double & { return s.parameters.gravity[i].gravity; }));
        }
        e.push_back(real("branch_expansion",
                         "Above-ground over stem biomass, BEF2 of temperate conifers (IPCC Good "
                         "Practice Guidance for LULUCF 2003, Table 3A.1.10).",
                         [](Settings &s) -> double & { return s.parameters.branchExpansion; }));
        e.push_back(real("root_intercept",
                         "Root biomass = exp(root_intercept + root_slope * ln(above-ground)), t/ha "
                         "(Cairns et al. 1997, Oecologia 111:1-11).",
                         [](Settings &s) -> double & { return s.parameters.rootIntercept; }));
        e.push_back(
            real("root_slope", "", [](Settings &s) -> double & { return s.parameters.rootSlope; }));
        e.push_back(real("carbon_fraction",
                         "Carbon in a tonne of dry biomass (IPCC 2006, Vol. 4, Ch. 4).",
                         [](Settings &s) -> double & { return s.parameters.carbonFraction; }));
        for (std::size_t k = 0; k < kPoolNames.size(); ++k) {
            const std::string pool(kPoolNames[k]);
            e.push_back(
                real("mill_recovery." + pool,
                     k == 0 ? "Share of a class's stem wood made into the pool's products "
                              "(7-14 cm to paper, 14-20 cm to panels, >20 cm to "
                              "sawnwood); the rest is burnt or lost."
                            : "",
                     [k](Settings &s) -> double & { return s.parameters.millRecovery[k]; }));
        }
        for (std::size_t k = 0; k < kPoolNames.size(); ++k) {
            const std::string pool(kPoolNames[k]);
            e.push_back(real("half_life." + pool,
                             k == 0 ? "Half-life of products in use, years (IPCC 2006, Vol. 4, "
                                      "Ch. 12, Table 12.2)."
                                    : "",
                             [k](Settings &s) -> double & { return s.parameters.halfLife[k]; }));
        }
        e.push_back(real("buffer_share",
                         "Share of units held in the buffer (Woodland Carbon Code, "
                         "Requirements v2.1, 2.3).",
                         [](Settings &s) -> double & { return s.parameters.bufferShare; }));
        e.push_back(whole("first_vintage",
                          "Age of the first verification and years between the later ones "
                          "(Woodland Carbon Code: year 5, then every 10 years).",
                          [](Settings &s) -> int & { return s.parameters.firstVintage; }));
        e.push_back(whole("vintage_years", "",
                          [](Settings &s) -> int & { return s.parameters.vintageYears; }));
        e.push_back(yesNo("cap_at_long_term_average",
                          "Claims capped at the long-term average carbon stock (Woodland Carbon "
                          "Code, Requirements v2.1, 3.3).",
                          [](Settings &s) -> bool & { return s.parameters.capAtLongTermAverage; }));
        e.push_back(yesNo("products_in_claims",
                          "Carbon in products counts in the stock units are claimed on (the "
                          "Woodland Carbon Code does not count it).",
                          [](Settings &s) -> bool & { return s.parameters.productsInClaims; }));
        return e;
    }();
    return all;
}

/// `text` in double quotes (appended: GCC 12 warns falsely on a concatenation).
std::string quoted(std::string_view text) {
    std::string q;
    q.reserve(text.size() + 2);
    q.push_back('"');
    q.append(text);
    q.push_back('"');
    return q;
}

std::string_view trimmed(std::string_view s) {
    const auto first = s.find_first_not_of(" \t\r");
    if (first == std::string_view::npos) {
        return {};
    }
    return s.substr(first, s.find_last_not_of(" \t\r") - first + 1);
}

} // namespace

bool Settings::operator==(const Settings &other) const {
    return carbonText(*this) == carbonText(other);
}

Settings defaultSettings() {
    Settings s;
    s.pricing = {kDefaultCarbonPrice, Payment::kNone};
    return s;
}

CarbonReading readCarbonText(std::string_view text) {
    Settings s = defaultSettings();
    std::set<std::string, std::less<>> seen;
    int lineNumber = 0;
    const auto fault = [&lineNumber](const std::string &what) {
        return CarbonReading{std::nullopt, "line " + std::to_string(lineNumber) + ": " + what};
    };
    std::size_t start = 0;
    while (start <= text.size()) {
        const std::size_t end = std::min(text.find('\n', start), text.size());
        const std::string_view line = trimmed(text.substr(start, end - start));
        start = end + 1;
        ++lineNumber;
        if (line.empty() || line.front() == '#') {
            continue;
        }
        const std::size_t equals = line.find('=');
        if (equals == std::string_view::npos) {
            return fault("not a line of the form name = value");
        }
        const std::string_view name = trimmed(line.substr(0, equals));
        const std::string_view value = trimmed(line.substr(equals + 1));
        const auto entry = std::find_if(entries().begin(), entries().end(),
                                        [name](const Entry &e) { return e.name == name; });
        if (entry == entries().end()) {
            return fault("unknown name " + quoted(name));
        }
        if (!seen.insert(std::string(name)).second) {
            return fault(quoted(name) + " given twice");
        }
        if (!entry->set(s, value)) {
            return fault(quoted(value) + " is not a value of " + std::string(name));
        }
    }
    if (!(s.pricing.price >= 0.0 && s.pricing.price <= kMaxCarbonPrice)) {
        return {std::nullopt, "the carbon price must be from 0 to " + number(kMaxCarbonPrice) +
                                  " EUR per t CO2e"};
    }
    if (std::string problem = parameterFault(s.parameters); !problem.empty()) {
        return {std::nullopt, std::move(problem)};
    }
    return {s, {}};
}

std::string carbonText(const Settings &settings) {
    std::ostringstream out;
    out << "# ARBOLEX carbon price and carbon account constants (docs/carbon.md)\n";
    for (const Entry &e : entries()) {
        if (!e.comment.empty()) {
            out << "\n# " << e.comment << '\n';
        }
        out << e.name << " = " << e.show(settings) << '\n';
    }
    return out.str();
}

std::vector<ConstantEntry> constantEntries(const Settings &settings) {
    std::vector<ConstantEntry> constants;
    for (const Entry &e : entries()) {
        if (e.name != "price" && e.name != "payment") {
            constants.push_back({e.name, e.show(settings), e.comment});
        }
    }
    return constants;
}

} // namespace arbolex::carbon
