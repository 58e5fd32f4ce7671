#include "economics/carbonpricewindowlogic.hpp"

#include "economics/carbonformat.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/pricefieldkeys.hpp"
#include "economics/timberpricesmessages.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "workflow/mainmessages.hpp"

#include <array>
#include <utility>

namespace arbolex::economics {

namespace {

using C = CarbonPriceControl;

/// The options in the order of carbon::Payment.
constexpr std::array<C, 3> kOptions = {C::OptPaymentNone, C::OptPaymentFlow, C::OptPaymentUnits};

carbon::Payment paymentOf(C option) {
    return static_cast<carbon::Payment>(static_cast<int>(option) -
                                        static_cast<int>(C::OptPaymentNone));
}

QString windowLabel(const char *handler) {
    return QStringLiteral(" in frmCarbonPrice.") + QLatin1String(handler) + QStringLiteral("()");
}

} // namespace

CarbonPriceWindowLogic::CarbonPriceWindowLogic(prices::PriceData &data, shell::ErrorLog &log,
                                               ICarbonPriceView &view,
                                               shell::IInteractive &interactive)
    : m_data(data), m_log(log), m_view(view), m_interactive(interactive) {}

void CarbonPriceWindowLogic::Form_Load() {
    shell::guard(m_log, windowLabel("Form_Load"), [&] {
        namespace ct = carbontext;
        m_view.setCaption(ct::carbonPriceCaption());
        const std::pair<C, QString> texts[] = {{C::lblCarbonDesc, ct::lblCarbonDesc()},
                                               {C::OptPaymentNone, ct::optPaymentNone()},
                                               {C::OptPaymentFlow, ct::optPaymentFlow()},
                                               {C::OptPaymentUnits, ct::optPaymentUnits()},
                                               {C::lblPaymentNone, ct::lblPaymentNone()},
                                               {C::lblPaymentFlow, ct::lblPaymentFlow()},
                                               {C::lblPaymentUnits, ct::lblPaymentUnits()},
                                               {C::lblConstants, ct::lblConstants()},
                                               {C::cmdCloseCarbonPrice, ct::closeCarbonPrice()}};
        for (const auto &[control, caption] : texts) {
            m_view.setText(control, caption);
        }
        m_view.setConstants(constantsGrid(m_data.carbon));
        fillFields();
        showChangesState();
    });
}

void CarbonPriceWindowLogic::show() {
    Form_Load();
    m_view.showCentred();
}

void CarbonPriceWindowLogic::fillFields() {
    m_view.setText(C::txtCarbonPrice, carbonPriceText(m_data.carbon.pricing.price));
    for (const C option : kOptions) {
        m_view.setChecked(option, paymentOf(option) == m_data.carbon.pricing.payment);
    }
}

void CarbonPriceWindowLogic::showChangesState() {
    m_view.setText(C::cmdChangeCarbonPrice,
                   m_changes ? text::acceptChanges() : text::allowChanges());
    m_view.setEditable(m_changes);
}

bool CarbonPriceWindowLogic::acceptFields() {
    const QString typed = m_view.text(C::txtCarbonPrice);
    const double price = typed.isEmpty() ? 0.0 : shell::val(typed);
    if (!(price >= 0.0 && price <= carbon::kMaxCarbonPrice)) {
        m_interactive.message(workflow::text::titleArbolex(),
                              carbontext::priceOutOfRange(carbonPriceText(carbon::kMaxCarbonPrice)),
                              shell::kExclamation);
        return false;
    }
    carbon::Pricing pricing{price, m_data.carbon.pricing.payment};
    for (const C option : kOptions) {
        if (m_view.isChecked(option)) {
            pricing.payment = paymentOf(option);
        }
    }
    const bool changed = pricing.price != m_data.carbon.pricing.price ||
                         pricing.payment != m_data.carbon.pricing.payment;
    m_data.carbon.pricing = pricing;
    fillFields();
    if (changed && m_changed) {
        m_changed();
    }
    return true;
}

void CarbonPriceWindowLogic::cmdChangeCarbonPrice_Click() {
    shell::guard(m_log, windowLabel("cmdChangeCarbonPrice_Click"), [&] {
        if (m_changes && !acceptFields()) {
            return;
        }
        m_changes = !m_changes;
        showChangesState();
    });
}

void CarbonPriceWindowLogic::cmdCloseCarbonPrice_Click() {
    shell::guard(m_log, windowLabel("cmdCloseCarbonPrice_Click"), [&] {
        // What was typed and not accepted is gone.
        m_changes = false;
        m_view.close();
    });
}

void CarbonPriceWindowLogic::choosePayment(C option) {
    if (!m_changes || !isPaymentOption(option)) {
        return;
    }
    for (const C o : kOptions) {
        m_view.setChecked(o, o == option);
    }
}

bool CarbonPriceWindowLogic::txtCarbonPrice_KeyPress(QChar key) const {
    return m_changes && priceKeyAccepted(m_view.text(C::txtCarbonPrice), key);
}

void CarbonPriceWindowLogic::typeText(const QString &typed) {
    if (!txtCarbonPrice_KeyPress(kBackspace)) {
        return;
    }
    m_view.setText(C::txtCarbonPrice, typedPrice(typed));
}

bool CarbonPriceWindowLogic::press(C control) {
    if (isPaymentOption(control)) {
        choosePayment(control);
        return true;
    }
    switch (control) {
    case C::cmdChangeCarbonPrice:
        cmdChangeCarbonPrice_Click();
        return true;
    case C::cmdCloseCarbonPrice:
        cmdCloseCarbonPrice_Click();
        return true;
    default:
        return false;
    }
}

} // namespace arbolex::economics
