#pragma once

// The module `mdlNPV`: the rotation laid out year by year, from the first year
// of the projection table to the year of the final cut, with the timber
// revenue of each year, the costs, other revenues and operations the user
// types, and the cash flows discounted to the first year.

#include "shell/settings.hpp"
#include "work/timberrevenue.hpp"

#include <QString>

#include <array>
#include <cstdint>
#include <vector>

namespace arbolex::shell {
class ErrorLog;
}

namespace arbolex::work {

/// Columns of the cash flow, as the grid `NPV_Grid` shows them.
enum CashFlowColumn : int {
    kCfYear = 0,
    kCfOperation = 1, ///< text, kept in the operation list, not in the matrix
    kCfCost = 2,
    kCfTimberRevenue = 3,
    kCfOtherRevenues = 4,
    kCfTotalRevenues = 5,
    kCfCashFlow = 6,
    kCfDiscountedCashFlow = 7,
    kCashFlowColumnCount = 8,
};

/// One year of the cash flow, euro per ha.
struct CashFlowRecord {
    std::int16_t year = 0;
    QString operation;
    double cost = 0.0;
    double timberRevenue = 0.0;
    double otherRevenues = 0.0;
    double totalRevenues = 0.0;
    double cashFlow = 0.0;
    double discountedCashFlow = 0.0;

    bool operator==(const CashFlowRecord &) const = default;
};

class CashFlow {
public:
    /// Set rotation length: N = last year − first year of the projection table.
    void SetRotationLength(int firstYear, int lastYear);
    /// Dimension NPV arrays: N + 1 years, every entry emptied; the years are
    /// first year + i.
    void DimNPVArrays();
    /// Forgets the rotation: no year at all (a cleared table, another model).
    void reset();
    /// Load timber revenues: copies the revenue of each year into column 3.
    void LoadTimberRevenues(const TimberRevenue &revenue);
    /// Takes the operations, costs and other revenues typed into `other`
    /// for the years both cash flows hold (another rotation of the same stand).
    void copyTypedFrom(const CashFlow &other);

    /// Computes, year by year, total revenues, cash flow and the discounted
    /// cash flow (rounded to cents, halves to even) at the interest rate. A
    /// failure (a discount factor that overflows) is logged with
    /// " in mdlNPV.ComputeCashFlow()" and ends the computation at that year.
    /// Returns the number of years computed: years() when all were.
    int ComputeCashFlow(shell::ErrorLog &log);
    /// Sum net present value: the sum of the rounded discounted cash flows.
    double SumNPV() const;

    /// N, the rotation length in years; −1 before any rotation is laid out.
    int rotationLength() const { return m_length; }
    /// Years of the cash flow (N + 1), 0 before any rotation is laid out.
    int years() const { return static_cast<int>(m_operations.size()); }
    int firstYear() const { return m_firstYear; }

    /// Cash flow matrix entry (column, year index).
    double matrix(int column, int i) const;
    void setMatrix(int column, int i, double value);
    const QString &operation(int i) const { return m_operations.at(static_cast<std::size_t>(i)); }
    void setOperation(int i, const QString &text) {
        m_operations.at(static_cast<std::size_t>(i)) = text;
    }
    /// The cash flow record of year index i, as the matrix holds it.
    CashFlowRecord record(int i) const;

    /// Interest rate, percent (5 means 5 %).
    double interestRate() const { return m_interestRate; }
    void setInterestRate(double percent) { m_interestRate = percent; }

private:
    int m_firstYear = 0;
    int m_length = -1;
    std::array<std::vector<double>, kCashFlowColumnCount> m_matrix;
    std::vector<QString> m_operations;
    double m_interestRate = shell::kDefaultInterestRate;
};

} // namespace arbolex::work
