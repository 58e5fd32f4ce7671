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

void raiseFault(int number, unsigned line) {
    throw RuntimeFault{number, line};
}

} // namespace arbolex::engine
