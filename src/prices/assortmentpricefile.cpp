#include "prices/assortmentpricefile.hpp"

#include "shell/errorlog.hpp"
#include "shell/runtimeerror.hpp"
#include "shell/seqfile.hpp"

#include <QDir>
#include <QFileInfo>

#include <cmath>

namespace arbolex::prices {

namespace {

constexpr QLatin1String kGetLabel(" in procedure GetAssortmentPricesFromFile of Module Misc");
constexpr QLatin1String kWriteLabel("  in procedure WriteAssortmentPricesInFile of Module Misc");

QString classCaption(std::size_t i) {
    return QString::fromLatin1(rotation::kAssortmentClassCaptions.at(i));
}

} // namespace

AssortmentPricesReading readAssortmentPrices(const QString &path) {
    const QString name = QLatin1Char('"') + QFileInfo(path).fileName() + QLatin1Char('"');
    shell::SequentialReader in(path);
    if (in.openError()) {
        return {std::nullopt, name + QStringLiteral(": ") + in.openError().description};
    }
    rotation::AssortmentPriceList prices{};
    for (std::size_t i = 0; i < prices.size(); ++i) {
        const QString which = QStringLiteral(": the price of ") + classCaption(i) +
                              QStringLiteral(" (value ") + QString::number(i + 1) +
                              QStringLiteral(")");
        const shell::RuntimeError error = in.readNumber(prices[i]);
        if (error.number == shell::kErrInputPastEndOfFile) {
            return {std::nullopt, name + which + QStringLiteral(" is missing")};
        }
        if (error) {
            return {std::nullopt, name + which + QStringLiteral(" is not a number")};
        }
        if (!std::isfinite(prices[i]) || prices[i] < 0.0 || prices[i] > kMaxAssortmentPrice) {
            return {std::nullopt, name + which + QStringLiteral(" is not a price from 0 to ") +
                                      QString::number(kMaxAssortmentPrice, 'f', 2) +
                                      QStringLiteral(" euro/m3")};
        }
    }
    if (!in.atEnd()) {
        return {std::nullopt, name + QStringLiteral(": holds more than ") +
                                  QString::number(rotation::kAssortmentClassCount) +
                                  QStringLiteral(" prices")};
    }
    return {prices, {}};
}

void GetAssortmentPricesFromFile(const QString &dataFolder, PriceData &data, shell::ErrorLog &log) {
    const AssortmentPricesReading read =
        readAssortmentPrices(QDir(dataFolder).filePath(QLatin1String(kAssortmentPricesFile)));
    if (!read.prices) {
        log.append(QStringLiteral("FAULT - ") + read.fault +
                   QStringLiteral("; the assortment prices were not read") + kGetLabel);
        return;
    }
    data.assortmentPrices = *read.prices;
}

void WriteAssortmentPricesInFile(const QString &dataFolder, const PriceData &data,
                                 shell::ErrorLog &log) {
    shell::SequentialWriter out(QDir(dataFolder).filePath(QLatin1String(kAssortmentPricesFile)));
    auto check = [&log](const shell::RuntimeError &error, int line) {
        if (error) {
            log.append(shell::moduleErrorText(error, line, kWriteLabel));
        }
    };
    check(out.openError(), 10);
    for (const double price : data.assortmentPrices) {
        check(out.writeNumber(price), 20);
    }
    check(out.close(), 30);
}

} // namespace arbolex::prices
