#include "shell/startupfile.hpp"

#include "engine/catalogue.hpp"
#include "shell/errorlog.hpp"
#include "shell/runtimeerror.hpp"
#include "shell/seqfile.hpp"

#include <QDir>

#include <array>

namespace arbolex::shell {

namespace {

constexpr QLatin1String kLoadLabel(" in frmMain.Load()");
constexpr QLatin1String kUnloadLabel(" in frmMain.Unload()");

/// Statement numbers of the start-up file's open, its eight values and its close.
constexpr int kOpenLine = 10;
constexpr int kModelLine = 20;
constexpr std::array<int, 6> kGrowFromLines = {30, 40, 50, 60, 70, 80};
constexpr int kNetAreaLine = 90;
constexpr int kCloseLine = 100;

QString startupPath(const QString &dataFolder) {
    return QDir(dataFolder).filePath(QLatin1String(kStartupFile));
}

/// The six grow-from values in file order.
template <typename Values> auto growFrom(Values &v) {
    return std::array{&v.age, &v.basalArea, &v.stocking, &v.topHeight, &v.targetAge, &v.step};
}

/// The model menu has no item for an identifier outside the catalogue.
RuntimeError noSuchModel(int index) {
    return {340, QStringLiteral("Control array element '%1' doesn't exist").arg(index)};
}

} // namespace

bool readStartupFile(const QString &dataFolder, StartupValues &values, ErrorLog &log) {
    auto fail = [&](const RuntimeError &error, int line) {
        log.append(handlerErrorText(error, line, kLoadLabel));
        values = StartupValues{};
        return false;
    };
    SequentialReader in(startupPath(dataFolder));
    if (in.openError()) {
        return fail(in.openError(), kOpenLine);
    }
    StartupValues read;
    if (const RuntimeError error = in.readInteger(read.modelIndex)) {
        return fail(error, kModelLine);
    }
    if (read.modelIndex < 0 || read.modelIndex >= engine::kModelCount) {
        return fail(noSuchModel(read.modelIndex), kModelLine);
    }
    const auto fields = growFrom(read);
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (const RuntimeError error = in.readNumber(*fields[i])) {
            return fail(error, kGrowFromLines[i]);
        }
    }
    if (const RuntimeError error = in.readNumber(read.netArea)) {
        return fail(error, kNetAreaLine);
    }
    values = read;
    return true;
}

bool writeStartupFile(const QString &dataFolder, const StartupValues &values, ErrorLog &log) {
    bool written = true;
    auto check = [&](const RuntimeError &error, int line) {
        if (error) {
            log.append(handlerErrorText(error, line, kUnloadLabel));
            written = false;
        }
    };
    SequentialWriter out(startupPath(dataFolder));
    check(out.openError(), kOpenLine);
    check(out.writeInteger(values.modelIndex), kModelLine);
    const auto fields = growFrom(values);
    for (std::size_t i = 0; i < fields.size(); ++i) {
        check(out.writeSingle(*fields[i]), kGrowFromLines[i]);
    }
    check(out.writeNumber(values.netArea), kNetAreaLine);
    check(out.close(), kCloseLine);
    return written;
}

} // namespace arbolex::shell
