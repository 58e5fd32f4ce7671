// The carbon file "Carbon.qdm" as the programs read it.
//
// Beyond not crashing: a file the reader takes holds settings that pass the
// account's checks and read back the same from the text written for them; a
// file it refuses says why.
#include "carbon/carbonfile.hpp"

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    using namespace arbolex::carbon;
    const CarbonReading read =
        readCarbonText(std::string_view(reinterpret_cast<const char *>(data), size));
    if (!read.settings) {
        if (read.fault.empty()) {
            std::fputs("a refused carbon file gave no reason\n", stderr);
            std::abort();
        }
        return 0;
    }
    if (!parameterFault(read.settings->parameters).empty()) {
        std::fputs("a carbon file was taken with constants the account refuses\n", stderr);
        std::abort();
    }
    const CarbonReading again = readCarbonText(carbonText(*read.settings));
    if (!again.settings || !(*again.settings == *read.settings)) {
        std::fputs("written carbon settings did not read back the same\n", stderr);
        std::abort();
    }
    return 0;
}
