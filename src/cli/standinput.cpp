#include "cli/standinput.hpp"

#include "workflow/standmath.hpp"

#include <cmath>
#include <cstdio>

namespace arbolex::cli {

namespace {

/// π as the diameter and basal-area conversions have always written it.

QString fromUtf8(std::string_view s) {
    return QString::fromUtf8(s.data(), static_cast<qsizetype>(s.size()));
}

QString escaped(QString text) {
    return text.replace(QLatin1Char('\r'), QStringLiteral("\\r"))
        .replace(QLatin1Char('\n'), QStringLiteral("\\n"));
}

} // namespace

void StreamReport::showMessage(std::string_view title, std::string_view text, int style) {
    ++m_reports;
    m_err << "MSG\t" << escaped(fromUtf8(title)) << '\t' << escaped(fromUtf8(text)) << '\t' << style
          << Qt::endl;
}

void StreamReport::logError(std::string_view message) {
    ++m_reports;
    const QString line = fromUtf8(message);
    m_err << "LOG\t" << escaped(line) << Qt::endl;
    m_log.append(line);
}

std::vector<const char *> standOptionNames() {
    return {"model", "age", "stocking", "height", "basal-area", "dbh"};
}

QString standOptionsHelp() {
    return QStringLiteral(
        "  --model M          growth model, 0 to 21 (the model menu's entries)\n"
        "  --age A            age of the stand, years\n"
        "  --stocking N       stocking, stems/ha\n"
        "  --height H         top height, m\n"
        "  --basal-area G     basal area, m2/ha, or instead\n"
        "  --dbh D            mean diameter at breast height, cm (G = N*pi*D^2/40000)\n");
}

StandInput readStand(const Options &options) {
    StandInput stand;
    stand.model = static_cast<std::int16_t>(
        options.wholeNumber("model", 0, static_cast<int>(engine::kModelCount) - 1));
    stand.age = options.positive("age");
    stand.stocking = options.positive("stocking");
    stand.height = options.positive("height");
    if (options.oneOf({"basal-area", "dbh"}) == 0) {
        stand.basalArea = options.positive("basal-area");
    } else {
        stand.basalArea = workflow::basalAreaFromDbh(stand.stocking, options.positive("dbh"));
    }
    return stand;
}

QString formatNumber(double x) {
    char text[32];
    std::snprintf(text, sizeof text, "%.9g", x);
    return QString::fromLatin1(text);
}

bool selectModelAndSiteIndex(engine::Grow &grow, const StandInput &stand) {
    grow.GetModel(stand.model);
    // The correction factor follows the site index current at selection.
    grow.GetVCF();
    return grow.SiteIndex(stand.age, stand.height);
}

void writePreamble(QTextStream &out, const engine::Grow &grow, bool siteIndexOk) {
    out << "# site_index\t" << (siteIndexOk ? formatNumber(grow.siteIndex()) : QString()) << '\n';
    out << "# model\t" << fromUtf8(grow.label()) << '\n';
}

} // namespace arbolex::cli
