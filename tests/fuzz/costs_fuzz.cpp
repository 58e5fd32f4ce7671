// The cost file "Costs.qdm" as the start-up and the command-line program read it.
//
// Beyond not crashing: a file the reader takes holds two costs from 0 to the
// highest; a file it refuses changes nothing and says why.
#include "prices/costfile.hpp"
#include "scratchfolder.hpp"
#include "shell/errorlog.hpp"

namespace {

using namespace arbolex;

constexpr prices::CostDefaults kBefore{123.0, 4.5};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString folder = fuzz::scratchFolder();
    const QString path = fuzz::writeFile(folder, prices::kCostsFile, fuzz::inputBytes(data, size));
    const prices::CostsReading read = prices::readCosts(path);
    shell::ErrorLog log(fuzz::nowhere());
    prices::PriceData prices;
    prices.costs = kBefore;
    prices::GetCostsFromFile(folder, prices, log);
    if (!read.costs) {
        if (read.fault.isEmpty() || read.missing || prices.costs != kBefore) {
            qFatal("a refused cost file changed the costs or gave no reason");
        }
        return 0;
    }
    for (const double cost : {read.costs->establishment, read.costs->annual}) {
        if (!(cost >= 0.0 && cost <= prices::kMaxCost)) {
            qFatal("a cost out of range was taken");
        }
    }
    if (prices.costs != *read.costs) {
        qFatal("the start-up took other costs than the reader");
    }
    return 0;
}
