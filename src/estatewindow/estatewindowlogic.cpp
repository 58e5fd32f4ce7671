#include "estatewindow/estatewindowlogic.hpp"

#include "document/documentcontroller.hpp"
#include "document/opendocument.hpp"
#include "estate/resulttable.hpp"
#include "estateio/gdallayer.hpp"
#include "estatewindow/estatemessages.hpp"
#include "prices/prices.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "work/regimereplay.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"

#include <QDate>
#include <QFileInfo>

#include <algorithm>
#include <memory>
#include <thread>
#include <variant>

namespace arbolex::estatewindow {

namespace {

/// Grow step of an opened sub-compartment, years.
constexpr int kOpenedStep = 1;
/// Rows handed to a thread at a time: small enough that the progress moves.
constexpr std::size_t kChunkRows = 64;

/// Keeps every row of the run in memory, in input order.
class KeepingSink : public estate::IRowSink {
public:
    explicit KeepingSink(const estate::Layout &layout) : m_layout(layout) {}

    void write(const estate::EstateRow &row, const estate::RowResult &result) override {
        EstateResultRow r;
        r.line = row.line;
        r.id = QString::fromStdString(estate::rowId(m_layout, row.values));
        r.areaHa = result.areaHa;
        r.finalCutAge = result.finalCutAge;
        r.grown = result.status == estate::RowStatus::kOk;
        r.message = QString::fromStdString(result.message);
        estate::figureValues(result, r.figures);
        r.values = row.values;
        rows.push_back(std::move(r));
        logLines.insert(logLines.end(), result.logLines.begin(), result.logLines.end());
    }

    std::vector<EstateResultRow> rows;
    std::vector<std::string> logLines;

private:
    const estate::Layout &m_layout;
};

/// One run, shared by the worker and the window's thread.
struct Job {
    std::string path;
    estate::EstateDefaults defaults;
    estate::RunSettings settings;
    std::optional<estate::Layout> layout;
    std::vector<EstateResultRow> rows;
    std::vector<std::string> logLines;
    estate::RunSummary summary;
    /// Why the input could not be read.
    QString fault;
    /// A failure of the run itself.
    QString failure;
};

charts::HarvestForecast chartOf(const estate::Forecast &forecast, int firstYear) {
    charts::HarvestForecast chart;
    const std::vector<estate::Forecast::Line> lines = forecast.lines(firstYear);
    for (const estate::Forecast::Line &line : lines) {
        const QString species = QString::fromStdString(line.species);
        if (line.species != estate::kAllSpecies && !chart.species.contains(species)) {
            chart.species.append(species);
        }
        if (chart.years.empty() || chart.years.back() != line.year) {
            chart.years.push_back(line.year);
        }
    }
    chart.species.sort();
    chart.volumes.assign(static_cast<std::size_t>(chart.species.size()),
                         std::vector<double>(chart.years.size(), 0.0));
    for (const estate::Forecast::Line &line : lines) {
        if (line.species == estate::kAllSpecies) {
            continue;
        }
        const auto s =
            static_cast<std::size_t>(chart.species.indexOf(QString::fromStdString(line.species)));
        const auto y = static_cast<std::size_t>(line.year - chart.years.front());
        const auto litres = line.totals.thinningLitres + line.totals.finalCutLitres;
        chart.volumes[s][y] = static_cast<double>(litres) / 1000.0;
    }
    return chart;
}

} // namespace

EstateWindowLogic::EstateWindowLogic(work::StandWork &work, workflow::IMainCommands &main,
                                     document::DocumentController &documents, IEstateView &view,
                                     shell::IInteractive &interactive)
    : m_standWork(work), m_main(main), m_documents(documents), m_view(view),
      m_interactive(interactive) {
    m_settings.threads = static_cast<int>(std::max(1U, std::thread::hardware_concurrency()));
    m_settings.chunkRows = kChunkRows;
}

estate::EstateDefaults EstateWindowLogic::defaults() const {
    estate::EstateDefaults d;
    d.year = QDate::currentDate().year();
    d.economics.ratePercent = m_standWork.cashFlow().interestRate();
    prices::Prices longTerm;
    longTerm.data() = m_standWork.prices().data();
    longTerm.selectPriceSet(prices::kLongTermPrices);
    d.economics.prices = longTerm.pricesInUse();
    // Every sub-compartment at the data folder's costs, as arbolex-cli estate counts it.
    d.economics.establishmentCost = m_standWork.defaultEstablishmentCost();
    d.economics.annualCost = m_standWork.defaultAnnualCost();
    return d;
}

void EstateWindowLogic::mnuOpenEstate_Click() {
    if (m_running) {
        m_interactive.message(text::titleEstate(), text::alreadyRunning(), shell::kExclamation);
        return;
    }
    const QString path = m_view.chooseEstateFile();
    if (!path.isEmpty()) {
        openEstate(path);
    }
}

void EstateWindowLogic::openEstate(const QString &path) {
    shell::guard(
        m_standWork.errorLog(), QStringLiteral(" in frmEstate.mnuOpenEstate_Click()"), [&] {
            if (m_running) {
                return;
            }
            auto job = std::make_shared<Job>();
            job->path = QFileInfo(path).absoluteFilePath().toStdString();
            job->defaults = defaults();
            job->settings = m_settings;
            m_running = true;
            m_cancel = false;
            m_view.setProgress(0, -1);
            m_view.runInBackground(
                [this, job] {
                    try {
                        estateio::LayerReader reader(job->path, std::string(), false);
                        std::string problem;
                        job->layout = estateio::layoutOf(reader, problem);
                        if (!job->layout) {
                            job->fault = QString::fromStdString(problem);
                            return;
                        }
                        const long long inInput = reader.rowCount();
                        KeepingSink sink(*job->layout);
                        job->summary =
                            estate::runEstate(reader, sink, *job->layout, job->defaults,
                                              job->settings, [this, inInput](long long done) {
                                                  m_view.setProgress(done, inInput);
                                                  return !m_cancel.load();
                                              });
                        job->rows = std::move(sink.rows);
                        job->logLines = std::move(sink.logLines);
                    } catch (const estateio::GdalError &e) {
                        job->fault = QString::fromUtf8(e.what());
                    } catch (const std::exception &e) {
                        job->failure = QString::fromUtf8(e.what());
                    }
                },
                [this, job, path] {
                    m_running = false;
                    shell::ErrorLog &log = m_standWork.errorLog();
                    for (const std::string &line : job->logLines) {
                        log.append(QString::fromStdString(line));
                    }
                    if (!job->failure.isEmpty()) {
                        log.append(shell::windowFaultLine(
                            {shell::RuntimeError::internal(job->failure), 0},
                            QStringLiteral(" in frmEstate.mnuOpenEstate_Click()")));
                        m_interactive.message(text::titleEstate(),
                                              QStringLiteral("ERROR - ") + job->failure,
                                              shell::kExclamation);
                        return;
                    }
                    if (!job->fault.isEmpty()) {
                        m_interactive.message(text::titleEstate(),
                                              text::faultEstateFile(job->fault),
                                              shell::kExclamation);
                        return;
                    }
                    if (job->summary.cancelled) {
                        m_interactive.message(text::titleEstate(), text::estateCancelled(),
                                              shell::kInformation);
                        return;
                    }
                    m_file = path;
                    m_layout = job->layout;
                    m_defaults = job->defaults;
                    m_model.setRows(std::move(job->rows));
                    m_forecast = chartOf(job->summary.forecast, job->defaults.year);
                    m_summary = text::summary(job->summary.rows,
                                              job->summary.refused + job->summary.failed);
                    m_view.resultsChanged();
                    m_view.showWindow();
                });
        });
}

void EstateWindowLogic::openSubCompartment(int row) {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmEstate.grdEstate_DblClick()"), [&] {
        if (m_running || !m_layout || row < 0 || row >= m_model.rowCount()) {
            return;
        }
        const EstateResultRow &r = m_model.rows()[static_cast<std::size_t>(row)];
        if (!r.grown) {
            m_interactive.message(text::titleEstate(), text::faultRowNotGrown(r.id, r.message),
                                  shell::kExclamation);
            return;
        }
        const auto planned = estate::planRow(*m_layout, r.values, m_defaults);
        if (const auto *fault = std::get_if<std::string>(&planned)) {
            m_interactive.message(text::titleEstate(),
                                  text::faultRowNotGrown(r.id, QString::fromStdString(*fault)),
                                  shell::kExclamation);
            return;
        }
        if (!m_documents.maySafelyDiscard()) {
            return;
        }
        const auto &plan = std::get<estate::RowPlan>(planned);
        work::SubCompartment id;
        id.subCompartment = r.id;
        id.notes =
            QFileInfo(m_file).fileName() + QStringLiteral(", line ") + QString::number(r.line);
        // The sub-compartment written on a copy of the work, as the main
        // window writes its regime when it is typed in; the window then takes
        // the copy whole.
        work::StandWork opened(m_standWork.grow(), m_standWork.prices(), m_standWork.errorLog());
        opened.restore(document::documentForStand(m_standWork, plan.stand, id, r.finalCutAge,
                                                  kOpenedStep, plan.areaHa));
        const std::optional<QString> failed =
            work::replayRegime(opened, plan.stand, plan.regime, r.finalCutAge, m_interactive);
        m_main.restore(opened.snapshot());
        m_documents.adoptNew(r.id);
        if (failed) {
            m_interactive.message(text::titleEstate(), text::openStopped(r.id, *failed),
                                  shell::kExclamation);
        }
    });
}

} // namespace arbolex::estatewindow
