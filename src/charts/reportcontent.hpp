#pragma once

// Everything a printed report of one sub-compartment shows, gathered from the
// main window's logic as plain texts and chart data, so that the PDF, the
// printer and the command-line program print the same thing.

#include "charts/chartdata.hpp"

#include <QString>
#include <QStringList>

#include <optional>
#include <utility>
#include <vector>

namespace arbolex::economics {
class EconomicsWindowLogic;
}
namespace arbolex::work {
class StandWork;
}

namespace arbolex::charts {

/// A table as printed: its captions, the group above each caption (may be
/// empty) and its rows.
struct ReportTable {
    QStringList captions;
    QStringList groups;
    std::vector<QStringList> rows;

    bool empty() const { return rows.empty(); }
};

/// The economics of the rotation as the economics window values it.
struct EconomicsPage {
    /// "Economics of the rotation at 3.00 % a year".
    QString title;
    /// The stand, the regime, and the rate, prices and costs the figures used.
    QString stand;
    QString regime;
    QString money;
    /// The figures of the value panel: caption, value.
    std::vector<std::pair<QString, QString>> figures;
    /// NPV, LEV and MAI by rotation age.
    ChartData rotations;
    /// The optimiser's best regimes and the user's own, with the heading
    /// and the count of regimes grown; empty when the optimiser has not run.
    QString regimesTitle;
    ReportTable regimes;
    QString regimesNote;
};

/// The carbon account of the rotation the table holds, as a validator reads
/// it: what it is of, its totals, the constants with their sources, the
/// account year by year and its chart.
struct CarbonPage {
    QString title;
    /// The sub-compartment, model, species, rotation and carbon money.
    std::vector<std::pair<QString, QString>> identification;
    QString totalsTitle;
    std::vector<std::pair<QString, QString>> totals;
    QString constantsTitle;
    ReportTable constants;
    QString yearlyTitle;
    ReportTable yearly;
    QString yearlyNote;
    ChartData chart;
};

struct ReportContent {
    /// Identification of the sub-compartment (the document's); empty fields
    /// are left out.
    QString forest;
    QString compartment;
    QString subCompartment;
    QString description;

    /// The growth model in use ("SS Thinned …").
    QString modelLabel;
    /// The grow-from values and the net area as typed: caption, value.
    std::vector<std::pair<QString, QString>> inputs;
    QString siteIndex;
    QString yieldClass;

    ReportTable projection;
    ReportTable summary;
    /// The cash flow year by year; empty when the rotation has none.
    ReportTable cashFlow;
    QString netPresentValue; ///< euro per ha, as the NPV window shows it
    QString interestRate;    ///< percent

    ChartData standChart;
    ChartData incrementChart;
    ChartData cashFlowChart;

    /// The economics of the rotation; none unless the economics window has
    /// valued the table as it stands.
    std::optional<EconomicsPage> economics;
    /// The carbon account of the rotation; none before the final cut.
    std::optional<CarbonPage> carbon;
};

/// The report of the work as it stands: its summary made afresh, and the
/// cash flow computed on a copy with the costs and revenues typed so far.
ReportContent reportContent(work::StandWork &work);

/// The report with the economics page when the economics window has valued
/// the rotation the table holds now: its figures, rate and costs as the
/// window shows them, and the optimiser's regimes once it has run. No page
/// before the window has valued the table, nor after the table has changed.
ReportContent reportContent(work::StandWork &work, economics::EconomicsWindowLogic &economics);

/// The charts of the main window now (the panel beside the table).
struct RotationCharts {
    ChartData stand;
    ChartData increments;
    ChartData cashFlow;
    ChartData carbon;
};
RotationCharts rotationCharts(work::StandWork &work);

} // namespace arbolex::charts
