#include "work/mdlnpv.hpp"

#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "valuation/discounting.hpp"

namespace arbolex::work {

void CashFlow::SetRotationLength(int firstYear, int lastYear) {
    m_firstYear = static_cast<std::int16_t>(firstYear);
    m_length = static_cast<std::int16_t>(lastYear) - m_firstYear;
}

void CashFlow::DimNPVArrays() {
    const auto count = static_cast<std::size_t>(std::max(m_length + 1, 0));
    for (std::vector<double> &column : m_matrix) {
        column.assign(count, 0.0);
    }
    m_operations.assign(count, QString());
    for (std::size_t i = 0; i < count; ++i) {
        m_matrix[kCfYear][i] = m_firstYear + static_cast<int>(i);
    }
}

void CashFlow::reset() {
    m_length = -1;
    DimNPVArrays();
}

void CashFlow::LoadTimberRevenues(const TimberRevenue &revenue) {
    for (int i = 0; i < years(); ++i) {
        setMatrix(kCfTimberRevenue, i, revenue.at(m_firstYear + i));
    }
}

void CashFlow::copyTypedFrom(const CashFlow &other) {
    for (int j = 0; j < other.years(); ++j) {
        const int i = other.firstYear() + j - m_firstYear;
        if (i < 0 || i >= years()) {
            continue;
        }
        setOperation(i, other.operation(j));
        setMatrix(kCfCost, i, other.matrix(kCfCost, j));
        setMatrix(kCfOtherRevenues, i, other.matrix(kCfOtherRevenues, j));
    }
}

double CashFlow::matrix(int column, int i) const {
    return m_matrix.at(static_cast<std::size_t>(column)).at(static_cast<std::size_t>(i));
}

void CashFlow::setMatrix(int column, int i, double value) {
    m_matrix.at(static_cast<std::size_t>(column)).at(static_cast<std::size_t>(i)) = value;
}

CashFlowRecord CashFlow::record(int i) const {
    CashFlowRecord r;
    r.year = static_cast<std::int16_t>(matrix(kCfYear, i));
    r.operation = operation(i);
    r.cost = matrix(kCfCost, i);
    r.timberRevenue = matrix(kCfTimberRevenue, i);
    r.otherRevenues = matrix(kCfOtherRevenues, i);
    r.totalRevenues = matrix(kCfTotalRevenues, i);
    r.cashFlow = matrix(kCfCashFlow, i);
    r.discountedCashFlow = matrix(kCfDiscountedCashFlow, i);
    return r;
}

int CashFlow::ComputeCashFlow(shell::ErrorLog &log) {
    int i = 0;
    shell::guard(log, QStringLiteral(" in mdlNPV.ComputeCashFlow()"), [&] {
        for (; i < years(); ++i) {
            setMatrix(kCfTotalRevenues, i,
                      matrix(kCfOtherRevenues, i) + matrix(kCfTimberRevenue, i));
            setMatrix(kCfCashFlow, i, matrix(kCfTotalRevenues, i) - matrix(kCfCost, i));
            // Whole years since the first year of the table: that year is not
            // discounted, later ones annually and compound.
            const auto t = static_cast<std::int16_t>(matrix(kCfYear, i) - matrix(kCfYear, 0));
            const std::optional<double> discounted =
                valuation::discountedCashFlow(matrix(kCfCashFlow, i), m_interestRate, t);
            if (!discounted) {
                shell::raiseAppFault(shell::RuntimeError::overflow());
            }
            setMatrix(kCfDiscountedCashFlow, i, *discounted);
        }
    });
    return i;
}

double CashFlow::SumNPV() const {
    double sum = 0.0;
    for (int i = 0; i < years(); ++i) {
        sum += matrix(kCfDiscountedCashFlow, i);
    }
    return sum;
}

} // namespace arbolex::work
