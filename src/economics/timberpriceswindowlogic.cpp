#include "economics/timberpriceswindowlogic.hpp"

#include "economics/assortpricesmessages.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/carbonpricewindowlogic.hpp"
#include "economics/pricefieldkeys.hpp"
#include "economics/timberpricesmessages.hpp"
#include "prices/pricelookup.hpp"
#include "shell/apperror.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"

#include <utility>

namespace arbolex::economics {

namespace {

/// Display format of a price, euro per m³.
constexpr char16_t kPriceFormat[] = u"#0.00";

/// The first field of each block; the block number is the price set's.
constexpr int kUserFirstField = prices::kUserPrices * prices::kPriceClassCount;

TimberPricesItem field(int index) {
    return {TimberPricesControl::txtTimbVal, index};
}

TimberPricesItem single(TimberPricesControl control) {
    return {control, 0};
}

bool isUserField(int index) {
    return index >= kUserFirstField && index < kUserFirstField + prices::kPriceClassCount;
}

QString windowLabel(const char *handler) {
    return QStringLiteral(" in frmTimberPrices.") + QLatin1String(handler) + QStringLiteral("()");
}

} // namespace

TimberPricesWindowLogic::TimberPricesWindowLogic(prices::Prices &prices, shell::ErrorLog &log,
                                                 ITimberPricesView &view)
    : m_prices(prices), m_log(log), m_view(view) {}

prices::PriceSet TimberPricesWindowLogic::priceSetOf(TimberPricesControl option) {
    return static_cast<prices::PriceSet>(static_cast<int>(option) -
                                         static_cast<int>(TimberPricesControl::OptCurentPrices));
}

TimberPricesControl TimberPricesWindowLogic::optionOf(prices::PriceSet set) {
    return static_cast<TimberPricesControl>(static_cast<int>(TimberPricesControl::OptCurentPrices) +
                                            set);
}

void TimberPricesWindowLogic::Form_Load() {
    shell::guard(m_log, windowLabel("Form_Load"), [&] {
        using C = TimberPricesControl;
        m_view.setCaption(text::timberPricesCaption());
        for (int k = 0; k < prices::kPriceClassCount; ++k) {
            m_view.setText({C::lblTimbCat, k},
                           prices::kTimberCategoryCaptions.at(static_cast<std::size_t>(k)));
        }
        const QString frames[kPriceBlockCount] = {text::fraCurrent(), text::fraUser(),
                                                  text::fraLongTerm(), text::fraOvra()};
        for (int b = 0; b < kPriceBlockCount; ++b) {
            m_view.setText({C::fraTimbPrice, b}, frames[b]);
        }
        const prices::PriceData &data = m_prices.data();
        const std::pair<C, QString> texts[] = {
            {C::OptCurentPrices, text::optCurentPrices()},
            {C::OptUserPrices, text::optUserPrices()},
            {C::OptNPVprices, text::optNPVprices()},
            {C::OptOvraPrices, text::optOvraPrices()},
            {C::lblCTP, text::lblCTP()},
            {C::lblUTP, text::lblUTP()},
            {C::lblnpvTP, text::lblnpvTP()},
            {C::lblOVRA_TP, text::lblOVRA_TP(data.privatePeriod[0], data.privatePeriod[1])},
            {C::lblNote, text::lblNote()},
            {C::lblNote2, text::lblNote2()},
            {C::lblNote_OVRA1, text::lblNote_OVRA1()},
            {C::lblNote_OVRA2, text::lblNote_OVRA2()},
            {C::cmdClosePricesList, text::closePricesList()},
            {C::cmdAssortPrices, text::assortPricesButton()},
            {C::cmdCarbonPrice, carbontext::carbonPriceButton()}};
        for (const auto &[control, caption] : texts) {
            m_view.setText(single(control), caption);
        }
        FillPriceFields();
        checkOption(static_cast<prices::PriceSet>(m_prices.priceSetInUse()));
        showChangesState();
    });
}

void TimberPricesWindowLogic::show() {
    Form_Load();
    m_view.showCentred();
}

void TimberPricesWindowLogic::FillPriceFields() {
    for (int f = 0; f < kPriceFieldCount; ++f) {
        const prices::PriceList *list =
            m_prices.priceSet(static_cast<std::int16_t>(f / prices::kPriceClassCount));
        const double price = list->at(static_cast<std::size_t>(f % prices::kPriceClassCount));
        m_view.setText(field(f), shell::formatNumber(price, kPriceFormat));
        m_view.setNegative(f, price < 0.0);
    }
}

void TimberPricesWindowLogic::checkOption(prices::PriceSet set) {
    for (int s = prices::kCurrentPrices; s <= prices::kPrivatePrices; ++s) {
        m_view.setChecked(optionOf(static_cast<prices::PriceSet>(s)), s == set);
    }
}

void TimberPricesWindowLogic::showChangesState() {
    const bool changes = m_prices.priceChanges();
    m_view.setText(single(TimberPricesControl::cmdChangePrices),
                   changes ? text::acceptChanges() : text::allowChanges());
    m_view.setUserPricesEditable(changes);
}

void TimberPricesWindowLogic::cmdChangePrices_Click() {
    shell::guard(m_log, windowLabel("cmdChangePrices_Click"), [&] {
        if (!m_prices.priceChanges()) {
            m_prices.setPriceChanges(true);
            showChangesState();
            return;
        }
        m_prices.setPriceChanges(false);
        showChangesState();
        prices::PriceList &user = m_prices.data().userDefined;
        for (int k = 0; k < prices::kPriceClassCount; ++k) {
            const int f = kUserFirstField + k;
            if (m_view.text(field(f)).isEmpty()) {
                m_view.setText(field(f), QStringLiteral("0"));
            }
            const double price = shell::val(m_view.text(field(f)));
            user.at(static_cast<std::size_t>(k)) = price;
            m_view.setNegative(f, price < 0.0);
        }
        // Prices in use are a copy: when they are the user's, they follow the edit.
        if (m_prices.priceSetInUse() == prices::kUserPrices) {
            m_prices.selectPriceSet(prices::kUserPrices);
        }
    });
}

void TimberPricesWindowLogic::selectPrices(prices::PriceSet set, const char *label) {
    shell::guard(m_log, windowLabel(label), [&] {
        m_prices.selectPriceSet(set);
        checkOption(set);
    });
}

void TimberPricesWindowLogic::OptCurentPrices_Click() {
    selectPrices(prices::kCurrentPrices, "OptCurentPrices_Click");
}

void TimberPricesWindowLogic::OptUserPrices_Click() {
    selectPrices(prices::kUserPrices, "OptUserPrices_Click");
}

void TimberPricesWindowLogic::OptNPVprices_Click() {
    selectPrices(prices::kLongTermPrices, "OptNPVprices_Click");
}

void TimberPricesWindowLogic::OptOvraPrices_Click() {
    selectPrices(prices::kPrivatePrices, "OptOvraPrices_Click");
}

void TimberPricesWindowLogic::cmdClosePricesList_Click() {
    shell::guard(m_log, windowLabel("cmdClosePricesList_Click"), [&] { m_view.close(); });
}

void TimberPricesWindowLogic::cmdAssortPrices_Click() {
    shell::guard(m_log, windowLabel("cmdAssortPrices_Click"), [&] {
        if (m_assortPrices != nullptr) {
            m_assortPrices->show();
        }
    });
}

void TimberPricesWindowLogic::cmdCarbonPrice_Click() {
    shell::guard(m_log, windowLabel("cmdCarbonPrice_Click"), [&] {
        if (m_carbonPrice != nullptr) {
            m_carbonPrice->show();
        }
    });
}

bool TimberPricesWindowLogic::txtTimbVal_KeyPress(int f, QChar key) const {
    if (!m_prices.priceChanges() || !isUserField(f)) {
        return false;
    }
    return priceKeyAccepted(m_view.text(field(f)), key);
}

void TimberPricesWindowLogic::typeText(int f, const QString &typed) {
    if (!txtTimbVal_KeyPress(f, kBackspace)) {
        return;
    }
    m_view.setText(field(f), typedPrice(typed));
}

bool TimberPricesWindowLogic::press(TimberPricesControl control) {
    switch (control) {
    case TimberPricesControl::OptCurentPrices:
        OptCurentPrices_Click();
        return true;
    case TimberPricesControl::OptUserPrices:
        OptUserPrices_Click();
        return true;
    case TimberPricesControl::OptNPVprices:
        OptNPVprices_Click();
        return true;
    case TimberPricesControl::OptOvraPrices:
        OptOvraPrices_Click();
        return true;
    case TimberPricesControl::cmdChangePrices:
        cmdChangePrices_Click();
        return true;
    case TimberPricesControl::cmdClosePricesList:
        cmdClosePricesList_Click();
        return true;
    case TimberPricesControl::cmdAssortPrices:
        cmdAssortPrices_Click();
        return true;
    case TimberPricesControl::cmdCarbonPrice:
        cmdCarbonPrice_Click();
        return true;
    default:
        return false;
    }
}

} // namespace arbolex::economics
