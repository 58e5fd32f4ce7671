#pragma once

#include "mocks/programservices.hpp"
#include "mocks/qtprinters.hpp"
#include "mocks/sessionservices.hpp"

#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "shell/vbtext.hpp"
#include "workflow/headlessmainview.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QFile>
#include <QTemporaryDir>

#include <initializer_list>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

namespace arbolex::testing {

using workflow::MainControl;

/// A main window without a screen over a temporary data folder, with model 0
/// active and the grow-from fields of a young Sitka spruce stand.
class MainWindowTest : public ::testing::Test, protected SessionServices {
protected:
    MainWindowTest() {
        grow.GetModel(0);
        logic.mnuModel_Click(0);
    }

    void type(MainControl c, const QString &text) { logic.typeText(c, text); }

    /// Types each field's text into `into`, in order.
    static void typeFields(workflow::MainWindowLogic &into,
                           std::initializer_list<std::pair<MainControl, QString>> fields) {
        for (const auto &[control, text] : fields) {
            into.typeText(control, text);
        }
    }

    /// Age 15, 2500 stems/ha, 7 m, 20 m²/ha, to `to` by `by`.
    void typeStand(const QString &to = QStringLiteral("50"),
                   const QString &by = QStringLiteral("5")) {
        typeFields(logic, {{MainControl::txtFromA, QStringLiteral("15")},
                           {MainControl::txtFromN, QStringLiteral("2500")},
                           {MainControl::txtFromH, QStringLiteral("7")},
                           {MainControl::txtFromB, QStringLiteral("20")},
                           {MainControl::txtToA, to},
                           {MainControl::txtByA, by}});
    }

    /// The rows' cells, to compare tables.
    std::vector<QStringList> tableCells() const {
        std::vector<QStringList> all;
        for (int r = 1; r <= logic.table().lastRow(); ++r) {
            all.push_back(logic.table().row(r).cells);
        }
        return all;
    }

    QString cell(int row, int column) const { return logic.table().row(row).cells.value(column); }

    QStringList logLines() const {
        QFile f(log.path());
        if (!f.open(QIODevice::ReadOnly)) {
            return {};
        }
        return QString::fromUtf8(f.readAll()).split(QStringLiteral("\r\n"), Qt::SkipEmptyParts);
    }
};

} // namespace arbolex::testing
