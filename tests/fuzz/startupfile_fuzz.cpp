// readStartupFile over "IFPRM1.dat". Beyond not crashing: a file that reads
// must read the same after the exit has written it back, and a file that
// does not read leaves the defaults.
#include "scratchfolder.hpp"
#include "shell/errorlog.hpp"
#include "shell/startupfile.hpp"

using namespace arbolex;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QString folder = fuzz::scratchFolder();
    fuzz::writeFile(folder, shell::kStartupFile, fuzz::inputBytes(data, size));
    shell::ErrorLog log(fuzz::nowhere());
    shell::StartupValues first;
    first.age = -1; // a failed read must put back every default
    if (!shell::readStartupFile(folder, first, log)) {
        if (!(first == shell::StartupValues{})) {
            qFatal("a start-up file that does not read left values other than the defaults");
        }
        return 0;
    }
    if (!shell::writeStartupFile(folder, first, log)) {
        qFatal("the start-up file could not be written back");
    }
    shell::StartupValues again;
    if (!shell::readStartupFile(folder, again, log) || !(again == first)) {
        qFatal("the start-up file written at exit does not read back the same");
    }
    return 0;
}
