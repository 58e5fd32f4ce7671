// The assortment price file "AssortPrices.qdm" as the start-up reads it.
//
// Beyond not crashing: a file the reader takes holds three prices from 0 to
// the highest, and written back at exit it reads the same; a file it refuses
// changes nothing and says why.
#include "prices/assortmentpricefile.hpp"
#include "scratchfolder.hpp"
#include "shell/errorlog.hpp"

#include <cstdlib>

namespace {

using namespace arbolex;

constexpr rotation::AssortmentPriceList kBefore{1.5, 2.5, 3.5};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString folder = fuzz::scratchFolder();
    const QString path =
        fuzz::writeFile(folder, prices::kAssortmentPricesFile, fuzz::inputBytes(data, size));
    const prices::AssortmentPricesReading read = prices::readAssortmentPrices(path);
    shell::ErrorLog log(fuzz::nowhere());
    prices::PriceData prices;
    prices.assortmentPrices = kBefore;
    prices::GetAssortmentPricesFromFile(folder, prices, log);
    if (!read.prices) {
        if (read.fault.isEmpty() || prices.assortmentPrices != kBefore) {
            qFatal("a refused file changed the prices or gave no reason");
        }
        return 0;
    }
    for (const double price : *read.prices) {
        if (!(price >= 0.0 && price <= prices::kMaxAssortmentPrice)) {
            qFatal("a price out of range was taken");
        }
    }
    prices::WriteAssortmentPricesInFile(folder, prices, log);
    const prices::AssortmentPricesReading again = prices::readAssortmentPrices(path);
    if (!again.prices || *again.prices != *read.prices) {
        qFatal("assortment prices written at exit do not read back the same");
    }
    return 0;
}
