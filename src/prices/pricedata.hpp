#pragma once

#include "carbon/carbonfile.hpp"
#include "rotation/assortmentprices.hpp"
#include "rotation/priceclasses.hpp"

#include <QString>

#include <array>
#include <cstdint>

namespace arbolex::shell {
class ErrorLog;
}

namespace arbolex::prices {

using rotation::kPriceClassCount;
/// Thirteen standing timber prices, euro per m³, indexed 0 to 12 by mean tree
/// volume class (the classes are the captions kTimberCategoryCaptions).
using rotation::PriceList;

/// One of the five user-defined assortment categories.
struct UserCategory {
    /// The category's label.
    QString name;
    /// Small-end diameter, cm; 0 means the category is not defined.
    float smallEnd = 0;
    /// Big-end diameter, cm; 0 means no upper limit.
    float bigEnd = 0;
    /// Whether the category takes part in the assortment calculation; kept in
    /// memory only, never in the file.
    bool inUse = false;
};

/// Number of user-defined assortment categories.
inline constexpr int kUserCategoryCount = 5;

/// What a rotation costs unless the work says otherwise, euro per ha
/// ("Costs.qdm").
struct CostDefaults {
    /// Cost of establishing the crop, paid at planting (age 0).
    double establishment = 0.0;
    /// Cost of every year from age 1 to the final cut.
    double annual = 0.0;

    bool operator==(const CostDefaults &) const = default;
};

/// The price lists and user categories as read from the data folder.
struct PriceData {
    /// State forestry company's prices of the last full calendar year ("CURPRIC.qdm").
    PriceList current{};
    /// Growers' association private-sector prices ("OVRA_PRIC.qdm", never written).
    PriceList privateSector{};
    /// Prices typed by the user ("USRPRIC.qdm").
    PriceList userDefined{};
    /// Long-term average prices, used by the net present value ("AvPRIC_npv.qdm").
    PriceList longTermAverage{};
    /// First and last date of the private-sector price period.
    std::array<QString, 2> privatePeriod;
    /// User assortment categories 1 to 5 ("UD_Assort.qdm").
    std::array<UserCategory, kUserCategoryCount> categories;
    /// Prices of the top-diameter classes 7-14, 14-20 and >20 cm ("AssortPrices.qdm").
    rotation::AssortmentPriceList assortmentPrices{};
    /// Establishment and yearly cost a new work starts with ("Costs.qdm").
    CostDefaults costs;
    /// The carbon price, its payment and the constants of the carbon account
    /// ("Carbon.qdm").
    carbon::Settings carbon = carbon::defaultSettings();
    /// The carbon settings as the start-up read them (the defaults when the
    /// file could not be read): the exit writes the file only when the
    /// settings differ, so a file the program could not read stays as it is.
    carbon::Settings carbonAtStart = carbon::defaultSettings();
};

/// Data file names, joined to the data folder.
inline constexpr const char *kCurrentPricesFile = "CURPRIC.qdm";
inline constexpr const char *kPrivatePricesFile = "OVRA_PRIC.qdm";
inline constexpr const char *kUserPricesFile = "USRPRIC.qdm";
inline constexpr const char *kAveragePricesFile = "AvPRIC_npv.qdm";
inline constexpr const char *kUserAssortmentsFile = "UD_Assort.qdm";
inline constexpr const char *kAssortmentPricesFile = "AssortPrices.qdm";
/// Read only: the program never writes it.
inline constexpr const char *kCostsFile = "Costs.qdm";
/// Written at exit only when its settings were changed.
inline constexpr const char *kCarbonFile = carbon::kCarbonFile;
/// The files GetPricesFromFiles reads, in its order: it stops at the first
/// one missing.
inline constexpr const char *kFilesReadForPrices[] = {kCurrentPricesFile, kPrivatePricesFile,
                                                      kUserPricesFile, kAveragePricesFile,
                                                      kUserAssortmentsFile};
/// The files the exit writes back, which the data history keeps.
inline constexpr const char *kFilesWrittenAtExit[] = {kCurrentPricesFile, kUserPricesFile,
                                                      kAveragePricesFile, kUserAssortmentsFile,
                                                      kAssortmentPricesFile};

/// Selector of WritePricesInFiles.
enum PriceFileSelector : std::int16_t {
    kWriteCurrent = 0,
    kWriteUserDefined = 1,
    kWriteLongTermAverage = 2,
    kWriteAllPrices = 3, ///< current, user-defined and long-term, in that order
};

/// Reads, in this order, the current, private-sector (13 prices and the two
/// period strings), user-defined and long-term price lists, then the five
/// categories (name, small end, big end each). Entries not read keep what
/// `data` held. Failures are logged, never shown: a missing file (53) or a file
/// that ends early (62) stops the reading there, so the later files are not
/// read at all; a bad value (13) leaves its entry unchanged and reading goes on.
void GetPricesFromFiles(const QString &dataFolder, PriceData &data, shell::ErrorLog &log);

/// Writes price lists back: selector 0 the current prices, 1 the user-defined,
/// 2 the long-term average, 3 all three; any other value writes nothing. The
/// private-sector file is never written. Failures are logged and writing goes
/// on; a file that cannot be opened is left as it was.
void WritePricesInFiles(std::int16_t selector, const QString &dataFolder, const PriceData &data,
                        shell::ErrorLog &log);

/// Writes the five categories (quoted name, small end, big end each: 15 lines).
void WriteUserDefinedAssortmentsInFile(const QString &dataFolder, const PriceData &data,
                                       shell::ErrorLog &log);

} // namespace arbolex::prices
