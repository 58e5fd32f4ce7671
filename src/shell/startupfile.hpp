#pragma once

#include <QString>

#include <cstdint>

namespace arbolex::shell {

class ErrorLog;

/// Name of the start-up file in the data folder.
inline constexpr const char *kStartupFile = "IFPRM1.dat";

/// What the main window keeps between runs in the start-up file, in file order.
struct StartupValues {
    /// Model identifier 0 to 21 (the item of `mnuModel`).
    std::int16_t modelIndex = 0;
    /// Grow-from values in the argument order of `SetGrowFrom`, single precision:
    /// age (years), basal area (m²/ha), stocking (stems/ha), top height (m),
    /// target age (years), step (years).
    float age = 15;
    float basalArea = 20;
    float stocking = 2500;
    float topHeight = 7;
    float targetAge = 50;
    float step = 5;
    /// Net area of the sub-compartment, ha.
    double netArea = 0;

    bool operator==(const StartupValues &) const = default;
};

/// Reads the start-up file of `dataFolder` into `values`. A missing, damaged or
/// short file, or a model index outside the catalogue, leaves `values` at the
/// defaults of StartupValues, adds one line to the error log (" in
/// frmMain.Load()") and returns false.
bool readStartupFile(const QString &dataFolder, StartupValues &values, ErrorLog &log);

/// Writes the start-up file; the previous file is replaced only once the new
/// one is complete. Failures are logged (" in frmMain.Unload()"); returns true
/// when the file was written.
bool writeStartupFile(const QString &dataFolder, const StartupValues &values, ErrorLog &log);

} // namespace arbolex::shell
