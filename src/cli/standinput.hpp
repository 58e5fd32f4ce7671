#pragma once

// What the projection and thinning commands share: the stand typed on the
// command line, the engine's reports on stderr and in the error log, and the
// way numbers are written.

#include "cli/options.hpp"
#include "cli/output.hpp"
#include "engine/grow.hpp"
#include "rotation/rotation.hpp"
#include "shell/errorlog.hpp"

#include <QTextStream>

#include <cstdint>
#include <vector>

namespace arbolex::cli {

/// The engine's message boxes and failure lines as lines on stderr,
/// "MSG<TAB>title<TAB>text<TAB>style" and "LOG<TAB>line" (CR and LF written as
/// \r and \n); the failure lines are appended to the error log as well.
class StreamReport : public engine::IEngineReport {
public:
    StreamReport(QTextStream &err, const QString &dataFolder) : m_err(err), m_log(dataFolder) {}

    void showMessage(std::string_view title, std::string_view text, int style) override;
    void logError(std::string_view message) override;

    /// Messages and failure lines so far: any of them means the engine failed.
    int reports() const { return m_reports; }

private:
    QTextStream &m_err;
    shell::ErrorLog m_log;
    int m_reports = 0;
};

/// A sub-compartment as typed: model, age (years), stocking (stems/ha), top
/// height (m) and basal area (m²/ha), the latter given directly or from the
/// mean diameter. The stand a rotation starts from.
using StandInput = rotation::Stand;

/// The option names of the stand, without their dashes.
std::vector<const char *> standOptionNames();

/// Help lines of the stand options.
QString standOptionsHelp();

/// Reads the stand; --basal-area and --dbh exclude each other. Throws UsageError.
StandInput readStand(const Options &options);

/// The stand as the options that give it again: model, age, stocking,
/// height and the basal area (given, or from the diameter), each exactly.
Fields standFields(const StandInput &stand);

/// Makes the stand's model active with its volume correction factor, as the
/// model menu does, then computes the site index. Returns the site index's
/// success.
bool selectModelAndSiteIndex(engine::Grow &grow, const StandInput &stand);

/// The site index (nothing when it could not be computed) and the model's
/// label: the "# site_index" and "# model" lines of a table.
Fields standPreamble(const engine::Grow &grow, bool siteIndexOk);

/// Writes a command's output in one piece, once it is complete.
void writeOutput(QTextStream &out, const QByteArray &bytes);

} // namespace arbolex::cli
