#include "cli/standinput.hpp"

#include "rotation/standmath.hpp"

#include <cmath>

namespace arbolex::cli {

namespace {

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
        stand.basalArea = rotation::basalAreaFromDbh(stand.stocking, options.positive("dbh"));
    }
    return stand;
}

bool selectModelAndSiteIndex(engine::Grow &grow, const StandInput &stand) {
    grow.GetModel(stand.model);
    // The correction factor follows the site index current at selection.
    grow.GetVCF();
    return grow.SiteIndex(stand.age, stand.height);
}

Fields standFields(const StandInput &stand) {
    return {{QStringLiteral("model"), Value::whole(stand.model)},
            {QStringLiteral("age"), Value::number(stand.age)},
            {QStringLiteral("stocking"), Value::number(stand.stocking)},
            {QStringLiteral("height"), Value::number(stand.height)},
            {QStringLiteral("basal_area"), Value::number(stand.basalArea)}};
}

Fields standPreamble(const engine::Grow &grow, bool siteIndexOk) {
    return {{QStringLiteral("site_index"), siteIndexOk ? Value::number(grow.siteIndex()) : Value()},
            {QStringLiteral("model"), Value::word(fromUtf8(grow.label()))}};
}

void writeOutput(QTextStream &out, const QByteArray &bytes) {
    out << QString::fromUtf8(bytes);
    out.flush();
}

} // namespace arbolex::cli
