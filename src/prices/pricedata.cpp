#include "prices/pricedata.hpp"

#include "shell/errorlog.hpp"
#include "shell/runtimeerror.hpp"
#include "shell/seqfile.hpp"

#include <QDir>

namespace arbolex::prices {

using shell::RuntimeError;
using shell::SequentialReader;
using shell::SequentialWriter;

namespace {

constexpr QLatin1String kGetPricesLabel(" in procedure GetPricesFromFiles of Module Misc");
constexpr QLatin1String kWritePricesLabel("  in procedure WritePricesInFiles of Module Misc");
constexpr QLatin1String
    kWriteAssortmentsLabel("  in procedure WriteUserDefinedAssortmentsInFile of Module Misc");

/// Statement numbers reported as "in line" by GetPricesFromFiles: open, read
/// (and the period strings / category fields), one block per file.
enum GetPricesLine : int {
    kOpenCurrent = 10,
    kReadCurrent = 20,
    kOpenPrivate = 30,
    kReadPrivate = 40,
    kReadPeriodStart = 50,
    kReadPeriodEnd = 60,
    kOpenUser = 70,
    kReadUser = 80,
    kOpenAverage = 90,
    kReadAverage = 100,
    kOpenAssortments = 110,
    kReadCategoryName = 120,
    kReadCategorySmallEnd = 130,
    kReadCategoryBigEnd = 140,
};

QString inFolder(const QString &dataFolder, const char *fileName) {
    return QDir(dataFolder).filePath(QLatin1String(fileName));
}

/// Logs failures of one writer procedure; every failure resumes with the next statement.
class WriteLog {
public:
    WriteLog(shell::ErrorLog &log, QLatin1String label) : m_log(log), m_label(label) {}
    void check(const RuntimeError &error, int line) {
        if (error) {
            m_log.append(shell::moduleErrorText(error, line, m_label));
        }
    }

private:
    shell::ErrorLog &m_log;
    QLatin1String m_label;
};

/// Writes one price list; `firstLine` numbers its open statement, the writes
/// and the close follow at +1 and +2.
void writeList(const QString &path, const PriceList &list, int firstLine, WriteLog &log) {
    SequentialWriter out(path);
    log.check(out.openError(), firstLine);
    for (const double price : list) {
        log.check(out.writeNumber(price), firstLine + 1);
    }
    log.check(out.close(), firstLine + 2);
}

} // namespace

void GetPricesFromFiles(const QString &dataFolder, PriceData &data, shell::ErrorLog &log) {
    // Logs a failure; true when the reading must stop (missing file, early end).
    auto stops = [&log](const RuntimeError &error, int line) {
        if (!error) {
            return false;
        }
        log.append(shell::moduleErrorText(error, line, kGetPricesLabel));
        return error.number == shell::kErrFileNotFound ||
               error.number == shell::kErrInputPastEndOfFile;
    };
    auto readList = [&stops](SequentialReader &in, PriceList &list, int line) {
        for (double &price : list) {
            if (stops(in.readNumber(price), line)) {
                return false;
            }
        }
        return true;
    };

    {
        SequentialReader in(inFolder(dataFolder, kCurrentPricesFile));
        if (stops(in.openError(), kOpenCurrent) || !readList(in, data.current, kReadCurrent)) {
            return;
        }
    }
    {
        SequentialReader in(inFolder(dataFolder, kPrivatePricesFile));
        if (stops(in.openError(), kOpenPrivate) ||
            !readList(in, data.privateSector, kReadPrivate) ||
            stops(in.readString(data.privatePeriod[0]), kReadPeriodStart) ||
            stops(in.readString(data.privatePeriod[1]), kReadPeriodEnd)) {
            return;
        }
    }
    {
        SequentialReader in(inFolder(dataFolder, kUserPricesFile));
        if (stops(in.openError(), kOpenUser) || !readList(in, data.userDefined, kReadUser)) {
            return;
        }
    }
    {
        SequentialReader in(inFolder(dataFolder, kAveragePricesFile));
        if (stops(in.openError(), kOpenAverage) ||
            !readList(in, data.longTermAverage, kReadAverage)) {
            return;
        }
    }
    SequentialReader in(inFolder(dataFolder, kUserAssortmentsFile));
    if (stops(in.openError(), kOpenAssortments)) {
        return;
    }
    for (UserCategory &category : data.categories) {
        if (stops(in.readString(category.name), kReadCategoryName) ||
            stops(in.readNumber(category.smallEnd), kReadCategorySmallEnd) ||
            stops(in.readNumber(category.bigEnd), kReadCategoryBigEnd)) {
            return;
        }
    }
}

void WritePricesInFiles(std::int16_t selector, const QString &dataFolder, const PriceData &data,
                        shell::ErrorLog &log) {
    WriteLog writeLog(log, kWritePricesLabel);
    const bool all = selector == kWriteAllPrices;
    if (all || selector == kWriteCurrent) {
        writeList(inFolder(dataFolder, kCurrentPricesFile), data.current, 10, writeLog);
    }
    if (all || selector == kWriteUserDefined) {
        writeList(inFolder(dataFolder, kUserPricesFile), data.userDefined, 20, writeLog);
    }
    if (all || selector == kWriteLongTermAverage) {
        writeList(inFolder(dataFolder, kAveragePricesFile), data.longTermAverage, 30, writeLog);
    }
}

void WriteUserDefinedAssortmentsInFile(const QString &dataFolder, const PriceData &data,
                                       shell::ErrorLog &log) {
    WriteLog writeLog(log, kWriteAssortmentsLabel);
    SequentialWriter out(inFolder(dataFolder, kUserAssortmentsFile));
    writeLog.check(out.openError(), 10);
    for (const UserCategory &category : data.categories) {
        writeLog.check(out.writeString(category.name), 20);
        writeLog.check(out.writeSingle(category.smallEnd), 30);
        writeLog.check(out.writeSingle(category.bigEnd), 40);
    }
    writeLog.check(out.close(), 50);
}

} // namespace arbolex::prices
