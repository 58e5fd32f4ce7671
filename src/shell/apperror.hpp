#pragma once

// Run-time failures of the window logic and how a handler turns them into the
// one log line of the system. Every handler runs its body through guard(), so
// no failure escapes to the user as a crash.

#include "shell/errorlog.hpp"
#include "shell/runtimeerror.hpp"

#include <QString>

#include <cstdint>
#include <exception>
#include <new>

namespace arbolex::shell {

/// A detected run-time failure and the source line that failed.
struct AppFault {
    RuntimeError error;
    int line = 0;
};

/// Raises `error` at the line of the call.
[[noreturn]] void raiseAppFault(const RuntimeError &error, int line = __builtin_LINE());

/// "Error # :" + number + two blanks + description + " in line " + line + label,
/// the line of window event handlers and engine procedures.
QString windowFaultLine(const AppFault &fault, const QString &label);
/// "Error " + number + " " + description + " in line " + line + label, the line
/// of module procedures.
QString moduleFaultLine(const AppFault &fault, const QString &label);

/// Runs `body`; a failure inside it is logged with the handler's `label`
/// (" in frmMain.cmdGrow_Click()") and the handler ends there.
template <typename Body> void guard(ErrorLog &log, const QString &label, Body &&body) {
    try {
        body();
    } catch (const AppFault &fault) {
        log.append(windowFaultLine(fault, label));
    } catch (const std::bad_alloc &) {
        log.append(windowFaultLine({RuntimeError::outOfMemory(), 0}, label));
    } catch (const std::exception &e) {
        log.append(
            windowFaultLine({RuntimeError::internal(QString::fromUtf8(e.what())), 0}, label));
    }
}

/// Whole-number arithmetic of 16 bits, as the increments are summed in:
/// a result outside −32768..32767 is an overflow.
std::int16_t addInt16(int a, int b, int line = __builtin_LINE());

} // namespace arbolex::shell
