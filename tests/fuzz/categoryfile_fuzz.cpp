// The category file of `arbolex-cli assort --categories FILE`: read, then
// the categories it gives are computed for a stand as the command does.
#include "cli/categoryfile.hpp"
#include "cli/options.hpp"
#include "engine/grow.hpp"
#include "scratchfolder.hpp"

using namespace arbolex;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString path =
        fuzz::writeFile(fuzz::scratchFolder(), "categories.qdm", fuzz::inputBytes(data, size));
    std::vector<cli::NamedCategory> named;
    try {
        named = cli::readCategoryFile(path);
    } catch (const cli::UsageError &) {
        return 0;
    }
    std::vector<engine::AssortmentCategory> categories;
    for (const cli::NamedCategory &c : named) {
        categories.push_back(c.bounds);
    }
    // A thinned Sitka spruce stand at 40: 900 stems/ha, 20 m, 40 m²/ha.
    static engine::Grow grow;
    static const bool ready = [] {
        grow.GetModel(0);
        grow.GetVCF(); // the correction factor follows the site index current at selection
        return grow.SiteIndex(40.0f, 20.0f);
    }();
    engine::Assortment result;
    if (ready) {
        (void)grow.AsmtB(40.0f, 900.0f, 20.0f, categories, result);
    }
    return 0;
}
