// The economics window's figures: the rotation of the projection table
// valued, its explorer, tornado and Monte Carlo draws, and the optimiser run
// away from the window's thread.
#include "economics/economicswindowlogic.hpp"

#include "carbon/carbonfile.hpp"
#include "economics/carbonformat.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"
#include "prices/prices.hpp"
#include "rotation/standmath.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "work/incrementrows.hpp"
#include "work/regimereplay.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"

#include <algorithm>
#include <cmath>
#include <exception>
#include <limits>
#include <utility>

namespace arbolex::economics {

using C = EconomicsControl;

namespace {

/// Largest number of Monte Carlo draws: about a second of work.
constexpr int kMostDraws = 100000;
constexpr int kFewestDraws = 100;

bool sameStand(const rotation::Stand &a, const rotation::Stand &b) {
    return a.model == b.model && a.age == b.age && a.stocking == b.stocking &&
           a.height == b.height && a.basalArea == b.basalArea;
}

/// What the harvests were valued with, for the line under the stand.
QString pricesText(const rotation::Economics &e) {
    if (e.valuation == rotation::Valuation::kStandingPrice) {
        return QStringLiteral("long-term average timber prices");
    }
    QStringList classes;
    for (std::size_t i = 0; i < e.assortmentPrices.size(); ++i) {
        classes.append(QString::fromUtf8(
                           rotation::kAssortmentClassCaptions[i].data(),
                           static_cast<qsizetype>(rotation::kAssortmentClassCaptions[i].size())) +
                       QLatin1Char(' ') + QString::number(e.assortmentPrices[i], 'f', 2));
    }
    return QStringLiteral("assortment prices €/m³ ") + classes.join(QStringLiteral(", "));
}

bool sameMoney(const rotation::Economics &a, const rotation::Economics &b) {
    return a.ratePercent == b.ratePercent && a.establishmentCost == b.establishmentCost &&
           a.annualCost == b.annualCost && a.entries == b.entries && a.prices == b.prices &&
           a.valuation == b.valuation && a.assortmentPrices == b.assortmentPrices &&
           carbon::Settings{a.carbon, a.carbonParameters} ==
               carbon::Settings{b.carbon, b.carbonParameters};
}

/// What the cash flow typed into the net present value window adds, for the
/// line of the money: "" when nothing.
QString entriesText(const std::vector<rotation::CashFlowEntry> &entries) {
    double costs = 0.0;
    double revenues = 0.0;
    for (const rotation::CashFlowEntry &e : entries) {
        costs += e.cost;
        revenues += e.otherRevenue;
    }
    QStringList parts;
    if (costs != 0.0) {
        parts << QStringLiteral("costs ") + euroText(costs) + QStringLiteral(" €/ha");
    }
    if (revenues != 0.0) {
        parts << QStringLiteral("other revenues ") + euroText(revenues) + QStringLiteral(" €/ha");
    }
    return parts.isEmpty()
               ? QString()
               : QStringLiteral(" · the cash flow's ") + parts.join(QStringLiteral(" and "));
}

/// The carbon money, for the line of the money: "" when carbon is not paid.
QString carbonText(const carbon::Pricing &pricing) {
    return pricing.counts() ? QStringLiteral(" · ") + pricingText(pricing) : QString();
}

/// A cost as its field shows it.
QString costText(double euro) {
    return shell::generalNumber(euro);
}

/// The rotation of the table valued, as the optimiser scores a candidate.
rotation::Candidate candidateOf(const rotation::Regime &regime,
                                const rotation::RotationValue &value) {
    constexpr double kNone = -std::numeric_limits<double>::infinity();
    rotation::Candidate c;
    c.regime = regime;
    c.rotation = value.rotation;
    c.npv = value.npv.value_or(kNone);
    c.lev = value.lev.value_or(kNone);
    c.volume = value.mai * value.rotation;
    c.score = c.lev;
    return c;
}

QString irrText(const valuation::InternalRate &irr) {
    switch (irr.outcome) {
    case valuation::IrrOutcome::kRoot:
        return quantityText(irr.ratePercent, 2) + QStringLiteral(" % a year");
    case valuation::IrrOutcome::kNoSignChange:
        return economicstext::irrNoSignChange();
    case valuation::IrrOutcome::kNoRoot:
        return economicstext::irrNoRoot();
    case valuation::IrrOutcome::kMoreThanOneRoot:
        return economicstext::irrMoreThanOneRoot();
    }
    return {};
}

QString breakEvenText(const std::optional<double> &factor) {
    if (!factor) {
        return economicstext::breakEvenNone();
    }
    const double k = *factor;
    if (k <= 0.0) {
        return economicstext::breakEvenLandPays();
    }
    const QString times = quantityText(k, 2) + QStringLiteral(" × today's prices");
    if (k <= 1.0) {
        return times + QStringLiteral(" (prices may fall ") + quantityText((1.0 - k) * 100.0, 0) +
               QStringLiteral(" % before the land earns nothing)");
    }
    return times + QStringLiteral(" (prices must rise ") + quantityText((k - 1.0) * 100.0, 0) +
           QStringLiteral(" % for planting to pay)");
}

/// A whole number typed into a field, if it is one.
std::optional<long long> wholeNumber(const QString &typed) {
    bool ok = false;
    const long long n = typed.trimmed().toLongLong(&ok);
    return ok ? std::optional<long long>(n) : std::nullopt;
}

} // namespace

EconomicsWindowLogic::EconomicsWindowLogic(work::StandWork &work, workflow::IMainCommands &main,
                                           IEconomicsView &view, shell::IInteractive &interactive)
    : m_standWork(work), m_main(main), m_view(view), m_interactive(interactive) {
    // The costs are the work's: the fields follow it (a document opened, a
    // new one begun).
    QObject::connect(&work, &work::StandWork::costsChanged, [this] { showCosts(); });
}

void EconomicsWindowLogic::showCosts() {
    m_view.setText(C::txtEstablishmentCost, costText(m_standWork.establishmentCost()));
    m_view.setText(C::txtAnnualCost, costText(m_standWork.annualCost()));
}

void EconomicsWindowLogic::message(const QString &text, EconomicsControl focus) {
    m_interactive.message(economicstext::titleEconomics(), text, shell::kExclamation);
    m_view.focus(focus);
}

void EconomicsWindowLogic::cmdEconomics_Click() {
    Form_Load();
    m_view.showWindow();
}

void EconomicsWindowLogic::Form_Load() {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmEconomics.Form_Load()"), [&] {
        m_view.setText(C::txtInterestRate, percentText(m_standWork.cashFlow().interestRate()));
        const rotation::MonteCarloSettings draws;
        const auto fill = [&](C c, const QString &value) {
            if (m_view.text(c).isEmpty()) {
                m_view.setText(c, value);
            }
        };
        showCosts();
        fill(C::txtDraws, QString::number(draws.draws));
        fill(C::txtSeed, QString::number(draws.seed));
        fill(C::txtPriceSpread, shell::generalNumber(draws.priceSpread * 100.0));
        fill(C::txtRateLow, percentText(draws.rateLow));
        fill(C::txtRateHigh, percentText(draws.rateHigh));
        fill(C::txtCostSpread, shell::generalNumber(draws.costSpread * 100.0));
        fill(C::txtCarbonSpread, shell::generalNumber(draws.carbonSpread * 100.0));
        m_view.setEnabled(C::cmdCancel, false);
        m_view.setEnabled(C::cmdApply, !m_best.empty());
    });
    cmdCompute_Click();
}

bool EconomicsWindowLogic::readEconomics() {
    const QString rate = m_view.text(C::txtInterestRate).trimmed();
    if (!shell::isNumeric(rate) || !(shell::val(rate) > 0.0)) {
        message(economicstext::faultRate(), C::txtInterestRate);
        return false;
    }
    // The work's money (its cash flow's costs and other revenues, the
    // long-term average prices, the carbon settings), at the rate and costs
    // of the fields.
    rotation::Economics e = m_standWork.economics();
    e.ratePercent = shell::val(rate);
    for (const C c : {C::txtEstablishmentCost, C::txtAnnualCost}) {
        const QString typed = m_view.text(c).trimmed();
        if (!typed.isEmpty() && (!shell::isNumeric(typed) || shell::val(typed) < 0.0)) {
            message(economicstext::faultCost(), c);
            return false;
        }
        (c == C::txtEstablishmentCost ? e.establishmentCost : e.annualCost) = shell::val(typed);
    }
    // Every harvest at the standing price of its mean tree, or divided into
    // the assortment report's classes and sold at the assortment prices.
    if (m_view.text(C::cboValuation)
            .trimmed()
            .startsWith(QStringLiteral("assortment"), Qt::CaseInsensitive)) {
        e.valuation = rotation::Valuation::kAssortments;
    } else {
        e.assortmentPrices = {};
    }
    // One interest rate for the program: the cash flow's; the costs are the work's.
    m_standWork.cashFlow().setInterestRate(e.ratePercent);
    m_standWork.setCosts(e.establishmentCost, e.annualCost);
    m_economics = e;
    return true;
}

bool EconomicsWindowLogic::readStand() {
    const std::int16_t model = m_standWork.grow().modelId();
    if (const auto s = standFromTable(m_standWork.table(), model)) {
        m_stand = *s;
        return true;
    }
    // No table yet: the grow-from fields, checked as the grow command checks them.
    if (!m_main.checkGrowFrom()) {
        return false;
    }
    const auto value = [&](work::WorkField f) {
        return static_cast<float>(shell::val(m_standWork.field(f)));
    };
    const float stocking = value(work::WorkField::FromStocking);
    const float typedBasalArea = value(work::WorkField::FromBasalArea);
    const float basalArea =
        typedBasalArea > 0.0f
            ? typedBasalArea
            : rotation::basalAreaFromDbh(stocking, value(work::WorkField::FromDbh));
    m_stand = rotation::Stand{model, value(work::WorkField::FromAge), stocking,
                              value(work::WorkField::FromHeight), basalArea};
    return true;
}

void EconomicsWindowLogic::clearFigures(const QString &why) {
    m_path.reset();
    m_own.reset();
    m_value.reset();
    m_yours.reset();
    m_explorer = {};
    m_economicWithoutCarbon = 0;
    m_tornado.clear();
    m_monteCarlo.reset();
    for (int c = static_cast<int>(C::lblNPV); c <= static_cast<int>(C::lblMonteCarlo); ++c) {
        m_view.setText(static_cast<C>(c), QString());
    }
    m_view.setText(C::lblRegime, why);
    m_view.figuresChanged();
    m_view.monteCarloChanged();
}

void EconomicsWindowLogic::cmdCompute_Click() {
    shell::guard(
        m_standWork.errorLog(), QStringLiteral(" in frmEconomics.cmdCompute_Click()"), [&] {
            if (m_optimising) {
                return;
            }
            const rotation::Stand before = m_stand;
            const rotation::Economics money = m_economics;
            if (!readEconomics() || !readStand()) {
                return;
            }
            if (!sameStand(before, m_stand) || !sameMoney(money, m_economics)) {
                // The optimiser's regimes belong to another stand or other money.
                m_best.clear();
                m_view.setText(C::lblOptimiser, QString());
                m_view.setEnabled(C::cmdApply, false);
                m_view.regimesChanged();
            }
            m_table = regimeFromTable(m_standWork.table());
            rotation::GrowthFailure failure;
            m_path = rotation::growPath(m_grow, m_stand, m_table.regime, failure);
            if (!m_path) {
                clearFigures(QString::fromStdString(failure.text));
                return;
            }
            if (rotation::readsThinningClasses(m_economics)) {
                // Once for the explorers, the valuation and the draws.
                rotation::divideThinnings(*m_path);
            }
            m_explorer = rotation::exploreRotations(*m_path, m_table.regime, m_economics);
            m_economicWithoutCarbon = 0;
            if (m_economics.carbon.counts()) {
                // The same explorer with the timber's money alone.
                rotation::Economics timber = m_economics;
                timber.carbon.payment = carbon::Payment::kNone;
                m_economicWithoutCarbon =
                    rotation::exploreRotations(*m_path, m_table.regime, timber).economicRotation;
            }
            m_own = harvestsFromTable(m_standWork.table(), m_path->model, m_path->volumeRatio);
            if (m_own) {
                valueTable();
            } else if (!valueEconomicRotation()) {
                return;
            }
            showFigures();
            m_view.regimesChanged();
            cmdMonteCarlo_Click();
        });
}

bool EconomicsWindowLogic::figuresOfTable() const {
    if (!m_value) {
        return false;
    }
    const auto stand = standFromTable(m_standWork.table(), m_standWork.grow().modelId());
    if (!stand || !sameStand(*stand, m_stand)) {
        return false;
    }
    const TableRegime now = regimeFromTable(m_standWork.table());
    return now.ages == m_table.ages && now.volumes == m_table.volumes &&
           now.finalCut == m_table.finalCut;
}

void EconomicsWindowLogic::valueTable() {
    // The harvests as the table holds them: the figures of the stand today
    // are the net present value window's.
    m_rotation = m_own->rotation;
    m_value = rotation::valueHarvests(*m_own, m_economics);
    // The growth figures as the main window shows them.
    std::vector<double> mai;
    for (const int r : work::incrementRows(m_standWork.table())) {
        mai.push_back(m_standWork.table().row(r).numbers[work::kNumMai]);
    }
    m_value->maxMai = mai.empty() ? 0.0 : *std::max_element(mai.begin(), mai.end());
    m_value->yieldClass = m_standWork.yieldClass();
    m_tornado = rotation::tornado(*m_own, m_economics);
    m_yours = candidateOf(m_table.regime, *m_value);
}

bool EconomicsWindowLogic::valueEconomicRotation() {
    m_rotation = m_explorer.economicRotation;
    if (const auto problem = rotation::rotationProblem(*m_path, m_table.regime, m_rotation)) {
        clearFigures(QString::fromStdString(*problem));
        return false;
    }
    m_value = rotation::valueRotation(*m_path, m_rotation, m_economics);
    m_tornado = rotation::tornado(*m_path, m_rotation, m_economics);
    m_yours = rotation::scoreRotation(*m_path, m_table.regime, m_rotation, m_economics,
                                      rotation::Objective::kLev);
    return true;
}

QString EconomicsWindowLogic::rateText() const {
    return percentText(m_economics.ratePercent);
}

void EconomicsWindowLogic::showFigures() {
    const rotation::RotationValue &v = *m_value;
    const rotation::Stand &s = m_stand;
    m_view.setText(C::lblStand,
                   QString::fromStdString(m_grow.label()) + QStringLiteral(" · age ") +
                       QString::number(m_path->presentAge) + QStringLiteral(" years · ") +
                       quantityText(s.stocking, 0) + QStringLiteral(" stems/ha · top height ") +
                       quantityText(s.height, 1) + QStringLiteral(" m · basal area ") +
                       quantityText(s.basalArea, 1) + QStringLiteral(" m²/ha · site index ") +
                       quantityText(m_path->siteIndex, 1) + QStringLiteral(" m"));
    QString regime =
        m_own ? describeTableRotation(*m_own) : describeRegime(m_table.regime, m_rotation);
    if (const QString note = irregularNote(m_table, !m_own); !note.isEmpty()) {
        regime += QLatin1Char(' ') + note;
    }
    if (!m_own) {
        regime += QStringLiteral(" The table has no final cut: the economic rotation is valued.");
    }
    m_view.setText(C::lblRegime, regime);
    m_view.setText(C::lblRate, QStringLiteral("At ") + rateText() + QStringLiteral(" % a year · ") +
                                   pricesText(m_economics) + QStringLiteral(" · establishment ") +
                                   euroText(m_economics.establishmentCost) +
                                   QStringLiteral(" €/ha · annual cost ") +
                                   euroText(m_economics.annualCost) + QStringLiteral(" €/ha/yr") +
                                   entriesText(m_economics.entries) +
                                   carbonText(m_economics.carbon));
    m_view.setText(C::lblNPV, euroPerHaText(v.npv));
    m_view.setText(C::lblLEV, euroPerHaText(v.lev));
    m_view.setText(C::lblEAA, v.eaa ? euroText(*v.eaa) + QStringLiteral(" €/ha/yr")
                                    : economicstext::noFigure());
    m_view.setText(C::lblForestValue, euroPerHaText(v.forestValue));
    m_view.setText(C::lblIRR, irrText(v.irr));
    m_view.setText(C::lblBreakEven, breakEvenText(v.breakEvenPriceFactor));
    m_view.setText(C::lblRotation,
                   QString::number(m_rotation) +
                       (m_own ? QStringLiteral(" years (the final cut of the table)")
                              : QStringLiteral(" years (the economic rotation)")));
    double largestMai = 0.0;
    std::optional<double> largestLev;
    for (const rotation::RotationRow &row : m_explorer.rows) {
        if (row.age == m_explorer.biologicalRotation) {
            largestMai = row.mai;
        }
        if (row.age == m_explorer.economicRotation) {
            largestLev = row.lev;
        }
    }
    // The MAI of a young or slow stand may still rise at the models' age limit.
    const bool stillRising =
        !m_explorer.rows.empty() && m_explorer.biologicalRotation == m_explorer.rows.back().age;
    m_view.setText(C::lblBiological,
                   QString::number(m_explorer.biologicalRotation) +
                       (stillRising ? QStringLiteral(" years (the age limit: the MAI still rises, ")
                                    : QStringLiteral(" years (largest MAI, ")) +
                       quantityText(largestMai, 1) + QStringLiteral(" m³/ha/yr)"));
    m_view.setText(C::lblEconomic, m_explorer.economicRotation > 0
                                       ? QString::number(m_explorer.economicRotation) +
                                             QStringLiteral(" years (largest LEV, ") +
                                             euroPerHaText(largestLev) + QLatin1Char(')')
                                       : economicstext::noFigure());
    m_view.setText(C::lblMAI, quantityText(v.mai, 1) + QStringLiteral(" m³/ha/yr"));
    m_view.setText(C::lblYieldClass, v.yieldClass > 0
                                         ? QString::number(v.yieldClass)
                                         : QStringLiteral("not reached: the MAI still rises"));
    showCarbon();
    m_view.figuresChanged();
}

void EconomicsWindowLogic::showCarbon() {
    namespace et = economicstext;
    const rotation::RotationValue &v = *m_value;
    const carbon::Pricing &pricing = m_economics.carbon;
    QString named = pricingText(pricing);
    named[0] = named[0].toUpper();
    m_view.setText(C::lblCarbon, et::carbonHeading(pricingText(pricing)));
    const bool counts = pricing.counts();
    const QString notCounted = carbontext::notCounted();
    m_view.setText(C::lblNpvTimber, euroPerHaText(v.npvTimber));
    m_view.setText(C::lblNpvCarbon, counts ? euroPerHaText(v.npvCarbon) : notCounted);
    m_view.setText(C::lblNpvTotal, euroPerHaText(v.npv));
    m_view.setText(C::lblLevTimber, euroPerHaText(v.levTimber));
    m_view.setText(C::lblLevCarbon, counts ? euroPerHaText(v.levCarbon) : notCounted);
    m_view.setText(C::lblLevTotal, euroPerHaText(v.lev));
    QString rotationText;
    if (!counts) {
        rotationText = et::carbonNotCounted();
    } else if (m_economicWithoutCarbon > 0 && m_explorer.economicRotation > 0) {
        rotationText = m_economicWithoutCarbon == m_explorer.economicRotation
                           ? et::carbonKeepsRotation(named, m_explorer.economicRotation)
                           : et::carbonMovesRotation(named, m_economicWithoutCarbon,
                                                     m_explorer.economicRotation);
    }
    m_view.setText(C::lblCarbonRotation, rotationText);
}

void EconomicsWindowLogic::cmdMonteCarlo_Click() {
    shell::guard(
        m_standWork.errorLog(), QStringLiteral(" in frmEconomics.cmdMonteCarlo_Click()"), [&] {
            if (!m_path || !m_value) {
                message(economicstext::noStand(), C::txtInterestRate);
                return;
            }
            rotation::MonteCarloSettings s;
            const auto draws = wholeNumber(m_view.text(C::txtDraws));
            if (!draws || *draws < kFewestDraws || *draws > kMostDraws) {
                message(economicstext::faultDraws(), C::txtDraws);
                return;
            }
            s.draws = static_cast<int>(*draws);
            const auto seed = wholeNumber(m_view.text(C::txtSeed));
            if (!seed || *seed < 0) {
                message(economicstext::faultSeed(), C::txtSeed);
                return;
            }
            s.seed = static_cast<std::uint64_t>(*seed);
            for (const auto &[c, spread] : {std::pair{C::txtPriceSpread, &s.priceSpread},
                                            std::pair{C::txtCostSpread, &s.costSpread},
                                            std::pair{C::txtCarbonSpread, &s.carbonSpread}}) {
                const QString typed = m_view.text(c).trimmed();
                const double percent = shell::val(typed);
                if (!shell::isNumeric(typed) || percent < 0.0 || percent > 100.0) {
                    message(economicstext::faultSpread(), c);
                    return;
                }
                *spread = percent / 100.0;
            }
            const QString low = m_view.text(C::txtRateLow).trimmed();
            const QString high = m_view.text(C::txtRateHigh).trimmed();
            if (!shell::isNumeric(low) || !shell::isNumeric(high) || !(shell::val(low) > 0.0) ||
                !(shell::val(low) < shell::val(high))) {
                message(economicstext::faultRateRange(), C::txtRateLow);
                return;
            }
            s.rateLow = shell::val(low);
            s.rateHigh = shell::val(high);
            m_monteCarlo = m_own ? rotation::monteCarlo(*m_own, m_economics, s)
                                 : rotation::monteCarlo(*m_path, m_rotation, m_economics, s);
            const rotation::MonteCarloResult &r = *m_monteCarlo;
            m_view.setText(
                C::lblMonteCarlo,
                QStringLiteral("NPV P5 ") + euroText(r.npv.p5) + QStringLiteral(" · P50 ") +
                    euroText(r.npv.p50) + QStringLiteral(" · P95 ") + euroText(r.npv.p95) +
                    QStringLiteral(" €/ha · P(NPV < 0) = ") +
                    quantityText(r.probabilityNpvBelowZero * 100.0, 1) + QStringLiteral(" % · ") +
                    quantityText(s.draws, 0) + QStringLiteral(" draws at rates from ") +
                    percentText(s.rateLow) + QStringLiteral(" to ") + percentText(s.rateHigh) +
                    QStringLiteral(" % a year"));
            m_view.monteCarloChanged();
        });
}

void EconomicsWindowLogic::cmdOptimise_Click() {
    shell::guard(
        m_standWork.errorLog(), QStringLiteral(" in frmEconomics.cmdOptimise_Click()"), [&] {
            if (m_optimising) {
                return;
            }
            if (!m_path || !m_value) {
                message(economicstext::noStand(), C::txtInterestRate);
                return;
            }
            struct Job {
                rotation::Stand stand;
                rotation::Economics economics;
                rotation::OptimiserSettings settings;
                std::optional<rotation::OptimiserResult> result;
                rotation::GrowthFailure failure;
            };
            auto job = std::make_shared<Job>();
            job->stand = m_stand;
            job->economics = m_economics;
            m_optimising = true;
            m_cancel = false;
            for (const C c : {C::cmdOptimise, C::cmdApply, C::cmdCompute, C::cmdMonteCarlo}) {
                m_view.setEnabled(c, false);
            }
            m_view.setEnabled(C::cmdCancel, true);
            m_view.setText(C::lblOptimiser, QStringLiteral("Searching…"));
            m_view.setProgress(0.0);
            m_view.runInBackground(
                [this, job] {
                    // Each thread grows with an engine of its own.
                    try {
                        engine::Grow grow;
                        job->result =
                            rotation::optimise(grow, job->stand, job->economics, job->settings,
                                               job->failure, [this](double fraction) {
                                                   m_view.setProgress(fraction);
                                                   return !m_cancel.load();
                                               });
                    } catch (const std::exception &e) {
                        job->result.reset();
                        job->failure.text = e.what();
                    }
                },
                [this, job] {
                    m_optimising = false;
                    for (const C c : {C::cmdOptimise, C::cmdCompute, C::cmdMonteCarlo}) {
                        m_view.setEnabled(c, true);
                    }
                    m_view.setEnabled(C::cmdCancel, false);
                    if (!job->result) {
                        m_view.setText(C::lblOptimiser, QString());
                        message(economicstext::optimiserFailed() +
                                    QString::fromStdString(job->failure.text),
                                C::cmdOptimise);
                        return;
                    }
                    m_best = job->result->best;
                    m_chosen = 1;
                    m_view.setEnabled(C::cmdApply, !m_best.empty());
                    const QString grown = quantityText(job->result->regimesGrown, 0);
                    m_view.setText(C::lblOptimiser,
                                   job->result->completed
                                       ? grown + QStringLiteral(" regimes grown and valued at ") +
                                             rateText() + QStringLiteral(" % a year.")
                                       : QStringLiteral("Cancelled after ") + grown +
                                             QStringLiteral(" regimes: the best found so far."));
                    m_view.regimesChanged();
                });
        });
}

std::vector<QStringList> EconomicsWindowLogic::regimeGrid() const {
    std::vector<QStringList> grid{economicstext::regimeHeaders()};
    const auto row = [&](const QString &rank, const rotation::Candidate &c) {
        const rotation::Regime &g = c.regime;
        QStringList cells{rank};
        if (g.thins()) {
            cells << QString::number(g.thinFrom)
                  << (g.thinUntil.value_or(g.thinFrom) > g.thinFrom ? QString::number(g.thinEvery)
                                                                    : QString())
                  << quantityText(g.thinVolume, g.thinVolume == std::round(g.thinVolume) ? 0 : 1)
                  << QString::number(g.thinUntil.value_or(g.thinFrom));
        } else {
            cells << economicstext::noThinning() << QString() << QString() << QString();
        }
        cells << QString::number(c.rotation) << euroText(c.lev) << euroText(c.npv)
              << quantityText(c.volume, 0)
              << (m_yours ? euroText(c.lev - m_yours->lev) : economicstext::noFigure());
        return cells;
    };
    for (std::size_t i = 0; i < m_best.size(); ++i) {
        grid.push_back(row(QString::number(i + 1), m_best[i]));
    }
    if (m_yours) {
        grid.push_back(row(economicstext::regimeYours(), *m_yours));
    }
    return grid;
}

QString EconomicsWindowLogic::figuresText() const {
    QString lines;
    for (int c = static_cast<int>(C::lblStand); c <= static_cast<int>(C::lblMonteCarlo); ++c) {
        lines += economicsControlName(static_cast<C>(c)) + QLatin1Char('\t') +
                 m_view.text(static_cast<C>(c)) + QLatin1Char('\n');
    }
    return lines;
}

void EconomicsWindowLogic::typeText(EconomicsControl control, const QString &typed) {
    m_view.setText(control, typed);
}

bool EconomicsWindowLogic::press(EconomicsControl control) {
    switch (control) {
    case C::cmdCompute:
        cmdCompute_Click();
        return true;
    case C::cmdOptimise:
        cmdOptimise_Click();
        return true;
    case C::cmdCancel:
        cmdCancel_Click();
        return true;
    case C::cmdApply:
        cmdApply_Click(m_chosen);
        return true;
    case C::cmdMonteCarlo:
        cmdMonteCarlo_Click();
        return true;
    case C::cmdClose:
        cmdClose_Click();
        return true;
    default:
        return false;
    }
}

void EconomicsWindowLogic::cmdApply_Click(int rank) {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmEconomics.cmdApply_Click()"), [&] {
        if (m_optimising) {
            return;
        }
        if (rank < 1 || rank > static_cast<int>(m_best.size())) {
            message(economicstext::nothingToApply(), C::cmdOptimise);
            return;
        }
        // The regime written as the window writes it when it is typed in, on
        // a copy of the work; the main window then takes the copy whole.
        const rotation::Candidate chosen = m_best[static_cast<std::size_t>(rank - 1)];
        work::StandWork applied(m_standWork.grow(), m_standWork.prices(), m_standWork.errorLog());
        applied.restore(m_standWork.snapshot());
        const auto failed =
            work::replayRegime(applied, m_stand, chosen.regime, chosen.rotation, m_interactive);
        // What was typed into the cash flow stays, for the years the new
        // rotation still has: the optimiser counted it so.
        applied.cashFlow().copyTypedFrom(m_standWork.cashFlow());
        m_main.restore(applied.snapshot());
        if (failed) {
            m_interactive.message(economicstext::titleEconomics(),
                                  economicstext::applyStopped() + *failed, shell::kExclamation);
        }
        // The figures of the table as it now stands.
        cmdCompute_Click();
    });
}

} // namespace arbolex::economics
