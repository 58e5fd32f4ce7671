#include "prices/pricelookup.hpp"

#include "shell/interactive.hpp"
#include "shell/runtimeerror.hpp"

namespace arbolex::prices {

namespace {

constexpr QLatin1String kLookupLabel(" in procedure TrouveIndicePrix of Feuille frmMain");
constexpr QLatin1String
    kMessageTitle("ARBOLEX --- OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT");

/// A bound that does not convert is a type mismatch in its statement.
void showFailure(const rotation::PriceClassWalk &walk, shell::IInteractive &interactive) {
    interactive.message(kMessageTitle,
                        shell::moduleErrorText(shell::RuntimeError::typeMismatch(), walk.failedLine,
                                               kLookupLabel, QLatin1String("  ")),
                        shell::kCritical);
}

} // namespace

rotation::PriceClassWalk walkPriceClasses(double meanTreeVolume, const QLocale &locale) {
    return rotation::walkPriceClasses(
        meanTreeVolume, [&](std::size_t index, rotation::PriceBound side) {
            const std::string_view text = rotation::boundText(index, side);
            bool ok = false;
            const double value = locale.toDouble(
                QString::fromLatin1(text.data(), static_cast<qsizetype>(text.size())), &ok);
            return ok ? std::optional<double>(value) : std::nullopt;
        });
}

double TrouveIndicePrix(double meanTreeVolume, const PriceList &current,
                        shell::IInteractive &interactive, const QLocale &locale) {
    const rotation::PriceClassWalk walk = walkPriceClasses(meanTreeVolume, locale);
    if (walk.failed()) {
        showFailure(walk, interactive);
        return 0.0;
    }
    return current[static_cast<std::size_t>(walk.priceClass)];
}

int priceClassOf(double meanTreeVolume, shell::IInteractive &interactive, const QLocale &locale) {
    const rotation::PriceClassWalk walk = walkPriceClasses(meanTreeVolume, locale);
    if (walk.failed()) {
        showFailure(walk, interactive);
    }
    return walk.priceClass;
}

} // namespace arbolex::prices
