#pragma once

// The category file of `arbolex-cli assort --categories FILE`, in the format of
// "UD_Assort.qdm": name, small end and big end, five times.

#include "engine/assortment.hpp"

#include <QString>

#include <vector>

namespace arbolex::cli {

/// A category of the file: its name and bounds (cm).
struct NamedCategory {
    QString name;
    engine::AssortmentCategory bounds;
};

/// Reads the five categories of `path`; a category whose small end is 0 is not
/// defined and is left out. Throws UsageError when the file cannot be read or
/// a value is missing or wrong.
std::vector<NamedCategory> readCategoryFile(const QString &path);

} // namespace arbolex::cli
