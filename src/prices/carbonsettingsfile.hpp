#pragma once

// The carbon file "Carbon.qdm" of the data folder as the desktop program
// keeps it: read at start-up through the carbon library's reader (a file that
// is not right is logged and the settings stay the defaults), written at
// exit, whole and through a save file, only when the user changed them.

#include "prices/pricedata.hpp"

#include <QString>

#include <optional>

namespace arbolex::shell {
class ErrorLog;
}

namespace arbolex::prices {

/// What reading a carbon file gave: its settings, or why not.
struct CarbonSettingsReading {
    std::optional<carbon::Settings> settings;
    /// True when there is no such file at all.
    bool missing = false;
    /// What is wrong with the file, naming it and the line at fault.
    QString fault;
};

/// Reads and checks a whole carbon file (carbon::readCarbonText).
CarbonSettingsReading readCarbonSettings(const QString &path);

/// Start-up: the data folder's carbon settings replace `data`'s, and become
/// the settings the exit compares with, only when the whole file is right;
/// otherwise one line goes to the error log and nothing changes.
void GetCarbonSettingsFromFile(const QString &dataFolder, PriceData &data, shell::ErrorLog &log);

/// True when the carbon settings differ from those the start-up read.
bool carbonSettingsChanged(const PriceData &data);

/// Exit: writes the carbon settings with every constant's source. A file
/// that cannot be written is left as it was, and the failure is logged.
void WriteCarbonSettingsInFile(const QString &dataFolder, const PriceData &data,
                               shell::ErrorLog &log);

} // namespace arbolex::prices
