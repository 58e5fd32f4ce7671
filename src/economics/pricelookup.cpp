#include "economics/pricelookup.hpp"

#include "shell/interactive.hpp"

namespace arbolex::economics {

namespace {

constexpr QLatin1String kLookupLabel(" in procedure TrouveIndicePrix of Feuille frmMain");
constexpr QLatin1String
    kMessageTitle("ARBOLEX --- OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT");

/// Statement numbers of the three caption conversions.
enum LookupLine : int { kFirstUpperBound = 10, kLowerBound = 20, kUpperBound = 30 };

QString boundText(std::string_view text) {
    return QString::fromLatin1(text.data(), static_cast<qsizetype>(text.size()));
}

/// Upper bound text of a caption: of its last 5 characters, the first 4.
QString upperBoundText(QLatin1String caption) {
    return boundText(rotation::upperBoundText({caption.data(), std::size_t(caption.size())}));
}

/// Lower bound text of a caption: its first 4 characters.
QString lowerBoundText(QLatin1String caption) {
    return boundText(rotation::lowerBoundText({caption.data(), std::size_t(caption.size())}));
}

void showFailure(const PriceClassWalk &walk, shell::IInteractive &interactive) {
    interactive.message(
        kMessageTitle,
        shell::moduleErrorText(walk.error, walk.line, kLookupLabel, QLatin1String("  ")),
        shell::kCritical);
}

} // namespace

PriceClassWalk walkPriceClasses(double meanTreeVolume, const QLocale &locale) {
    PriceClassWalk walk;
    auto bound = [&](const QString &text, int line, double &value) {
        bool ok = false;
        value = locale.toDouble(text, &ok);
        if (!ok) {
            walk.error = shell::RuntimeError::typeMismatch();
            walk.line = line;
        }
        return ok;
    };
    constexpr int lastClass = kPriceClassCount - 1;
    for (int i = 0; i < lastClass; ++i) {
        const QLatin1String caption = kTimberCategoryCaptions[static_cast<std::size_t>(i)];
        double lower = 0.0;
        double upper = 0.0;
        if (i == 0) {
            if (!bound(upperBoundText(caption), kFirstUpperBound, upper)) {
                return walk;
            }
            if (upper >= meanTreeVolume) {
                walk.priceClass = 0;
                return walk;
            }
            continue;
        }
        if (!bound(lowerBoundText(caption), kLowerBound, lower)) {
            return walk;
        }
        if (lower <= meanTreeVolume) {
            if (!bound(upperBoundText(caption), kUpperBound, upper)) {
                return walk;
            }
            if (upper >= meanTreeVolume) {
                walk.priceClass = i;
                return walk;
            }
        }
    }
    walk.priceClass = lastClass; // "1.000 and Over:" is never read
    return walk;
}

double TrouveIndicePrix(double meanTreeVolume, const PriceList &current,
                        shell::IInteractive &interactive, const QLocale &locale) {
    const PriceClassWalk walk = walkPriceClasses(meanTreeVolume, locale);
    if (walk.error) {
        showFailure(walk, interactive);
        return 0.0;
    }
    return current[static_cast<std::size_t>(walk.priceClass)];
}

int priceClassOf(double meanTreeVolume, shell::IInteractive &interactive, const QLocale &locale) {
    const PriceClassWalk walk = walkPriceClasses(meanTreeVolume, locale);
    if (walk.error) {
        showFailure(walk, interactive);
    }
    return walk.priceClass;
}

} // namespace arbolex::economics
