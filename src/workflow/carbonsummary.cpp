#include "workflow/carbonsummary.hpp"

#include "economics/carbonformat.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/economicsformat.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::workflow {

CarbonSummary carbonSummary(const std::optional<rotation::RotationValue> &value,
                            const rotation::Economics &economics,
                            std::optional<std::pair<int, double>> lastStand) {
    using economics::tonnesText;
    CarbonSummary block;
    QString pricing = economics::pricingText(economics.carbon);
    if (economics.carbon.counts()) {
        pricing += QStringLiteral(", NPV at ") + economics::percentText(economics.ratePercent) +
                   QStringLiteral(" % a year");
    }
    block.heading = text::summaryCarbonHeading(pricing);
    if (!value || value->carbon.years.empty()) {
        if (lastStand) {
            block.figures.emplace_back(text::summaryCarbonInTrees(lastStand->first),
                                       tonnesText(lastStand->second));
        }
        return block;
    }
    const carbon::Account &account = value->carbon;
    const carbon::AccountYear &cut = account.years.back();
    block.figures = {
        {text::summaryCarbonAtFinalCut(), tonnesText(cut.trees + cut.harvested)},
        {text::summaryCarbonAverage(), tonnesText(account.longTermAverage)},
        {text::summaryCarbonNetRemoval(), tonnesText(cut.cumulativeNetRemoval)},
        {text::summaryCarbonUnits(), tonnesText(account.unitsTotal)},
        {text::summaryCarbonNpv(), economics.carbon.counts()
                                       ? economics::euroPerHaText(value->npvCarbon)
                                       : economics::carbontext::notCounted()},
    };
    return block;
}

} // namespace arbolex::workflow
