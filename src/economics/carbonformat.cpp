#include "economics/carbonformat.hpp"

#include "economics/carbonpricemessages.hpp"
#include "economics/economicsformat.hpp"
#include "shell/vbformat.hpp"

namespace arbolex::economics {

QString carbonPriceText(double price) {
    return shell::formatNumber(price, u"#0.00");
}

QString pricingText(const carbon::Pricing &pricing) {
    const QString price = QStringLiteral("carbon at ") + shell::generalNumber(pricing.price) +
                          QStringLiteral(" \u20ac/t CO\u2082e");
    if (pricing.payment == carbon::Payment::kNone) {
        return price + QStringLiteral(", not paid");
    }
    return price + QStringLiteral(" (") +
           carbontext::paymentWord(static_cast<int>(pricing.payment)) + QLatin1Char(')');
}

QString tonnesText(double tonnes) {
    return quantityText(tonnes, 1);
}

std::vector<QStringList> constantsGrid(const carbon::Settings &settings) {
    std::vector<QStringList> grid{carbontext::constantHeaders()};
    for (const carbon::ConstantEntry &c : carbon::constantEntries(settings)) {
        grid.push_back({QString::fromStdString(c.name), QString::fromStdString(c.value),
                        QString::fromStdString(c.source)});
    }
    return grid;
}

} // namespace arbolex::economics
