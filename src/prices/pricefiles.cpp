#include "prices/pricefiles.hpp"

#include "prices/assortmentpricefile.hpp"
#include "prices/carbonsettingsfile.hpp"
#include "prices/costfile.hpp"
#include "prices/pricedata.hpp"
#include "prices/prices.hpp"
#include "shell/apperror.hpp"
#include "shell/datahistory.hpp"
#include "shell/errorlog.hpp"

#include <QDir>

#include <iterator>
#include <vector>

namespace arbolex::prices {

void readPriceFiles(const QString &dataFolder, Prices &prices, shell::ErrorLog &log) {
    GetPricesFromFiles(dataFolder, prices.data(), log);
    GetAssortmentPricesFromFile(dataFolder, prices.data(), log);
    GetCostsFromFile(dataFolder, prices.data(), log);
    GetCarbonSettingsFromFile(dataFolder, prices.data(), log);
}

void rereadPriceFiles(const QString &dataFolder, Prices &prices, shell::ErrorLog &log) {
    const std::int16_t inUse = prices.priceSetInUse();
    prices.data() = PriceData{};
    readPriceFiles(dataFolder, prices, log);
    prices.selectPriceSet(inUse);
}

void writePriceFilesAtExit(const QString &dataFolder, const Prices &prices,
                           const shell::DataHistory *history, const QString &label,
                           shell::ErrorLog &log) {
    // The carbon file is written only when its settings changed: a file the
    // start-up could not read stays for the user to mend.
    const bool carbonChanged = carbonSettingsChanged(prices.data());
    if (history != nullptr) {
        std::vector<const char *> kept(std::begin(kFilesWrittenAtExit),
                                       std::end(kFilesWrittenAtExit));
        if (carbonChanged) {
            kept.push_back(kCarbonFile);
        }
        for (const char *name : kept) {
            shell::guard(log, label, [&] {
                if (!history->keep(QDir(dataFolder).filePath(QLatin1String(name)))) {
                    shell::raiseAppFault(shell::RuntimeError::pathFileAccessError());
                }
            });
        }
    }
    WritePricesInFiles(3, dataFolder, prices.data(), log);
    WriteUserDefinedAssortmentsInFile(dataFolder, prices.data(), log);
    WriteAssortmentPricesInFile(dataFolder, prices.data(), log);
    if (carbonChanged) {
        WriteCarbonSettingsInFile(dataFolder, prices.data(), log);
    }
}

} // namespace arbolex::prices
