#pragma once

// The yield class belongs to a rotation; the main window reads the same rule.
#include "rotation/yieldclass.hpp"

namespace arbolex::workflow {

using rotation::yieldClass;

} // namespace arbolex::workflow
