#include "engine/checkedmath.hpp"

namespace arbolex::engine {

std::string_view faultDescription(int number) {
    switch (number) {
    case kInvalidCall:
        return "Invalid procedure call or argument";
    case kOverflow:
        return "Overflow";
    case kDivisionByZero:
        return "Division by zero";
    default:
        return "Application-defined or object-defined error";
    }
}

void raiseFault(int number, std::source_location where) {
    throw RuntimeFault{number, static_cast<unsigned>(where.line())};
}

} // namespace arbolex::engine
