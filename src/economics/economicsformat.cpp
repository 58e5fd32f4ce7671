#include "economics/economicsformat.hpp"

#include "economics/economicsmessages.hpp"
#include "shell/vbformat.hpp"

#include <QLocale>

#include <cmath>

namespace arbolex::economics {

QString quantityText(double value, int decimals) {
    const double scale = std::pow(10.0, decimals);
    double rounded = std::round(value * scale) / scale;
    if (rounded == 0.0) {
        rounded = 0.0; // no "−0"
    }
    QString s = QLocale(QLocale::English).toString(std::fabs(rounded), 'f', decimals);
    return rounded < 0.0 ? QStringLiteral("−") + s : s;
}

QString euroText(double euro) {
    return quantityText(euro, 0);
}

QString euroPerHaText(const std::optional<double> &euro) {
    return euro ? euroText(*euro) + QStringLiteral(" €/ha") : economicstext::noFigure();
}

QString percentText(double percent) {
    return shell::formatNumber(percent, u"0.00##");
}

} // namespace arbolex::economics
