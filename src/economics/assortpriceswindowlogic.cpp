#include "economics/assortpriceswindowlogic.hpp"

#include "economics/assortpricesmessages.hpp"
#include "economics/pricefieldkeys.hpp"
#include "economics/timberpricesmessages.hpp"
#include "prices/assortmentpricefile.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::economics {

namespace {

/// Display format of a price, euro per m³.
constexpr char16_t kPriceFormat[] = u"#0.00";

AssortPricesItem field(int index) {
    return {AssortPricesControl::txtAsmtVal, index};
}

AssortPricesItem single(AssortPricesControl control) {
    return {control, 0};
}

QString classCaption(std::size_t i) {
    return QString::fromLatin1(rotation::kAssortmentClassCaptions.at(i));
}

QString windowLabel(const char *handler) {
    return QStringLiteral(" in frmAssortPrices.") + QLatin1String(handler) + QStringLiteral("()");
}

} // namespace

AssortPricesWindowLogic::AssortPricesWindowLogic(prices::PriceData &data, shell::ErrorLog &log,
                                                 IAssortPricesView &view,
                                                 shell::IInteractive &interactive)
    : m_data(data), m_log(log), m_view(view), m_interactive(interactive) {}

void AssortPricesWindowLogic::Form_Load() {
    shell::guard(m_log, windowLabel("Form_Load"), [&] {
        m_view.setCaption(text::assortPricesCaption());
        for (int k = 0; k < rotation::kAssortmentClassCount; ++k) {
            m_view.setText({AssortPricesControl::lblAsmtCat, k},
                           classCaption(static_cast<std::size_t>(k)) + QLatin1Char(':'));
        }
        m_view.setText(single(AssortPricesControl::lblAsmtDesc), text::lblAsmtDesc());
        m_view.setText(single(AssortPricesControl::cmdCloseAsmtPrices), text::closeAsmtPrices());
        fillPrices();
        showChangesState();
    });
}

void AssortPricesWindowLogic::show() {
    Form_Load();
    m_view.showCentred();
}

void AssortPricesWindowLogic::fillPrices() {
    for (int k = 0; k < rotation::kAssortmentClassCount; ++k) {
        m_view.setText(field(k),
                       shell::formatNumber(m_data.assortmentPrices.at(static_cast<std::size_t>(k)),
                                           kPriceFormat));
    }
}

void AssortPricesWindowLogic::showChangesState() {
    m_view.setText(single(AssortPricesControl::cmdChangeAsmtPrices),
                   m_changes ? text::acceptChanges() : text::allowChanges());
    m_view.setPricesEditable(m_changes);
}

bool AssortPricesWindowLogic::acceptFields() {
    rotation::AssortmentPriceList typed{};
    for (int k = 0; k < rotation::kAssortmentClassCount; ++k) {
        const auto i = static_cast<std::size_t>(k);
        typed.at(i) = m_view.text(field(k)).isEmpty() ? 0.0 : shell::val(m_view.text(field(k)));
        if (typed.at(i) > prices::kMaxAssortmentPrice) {
            m_interactive.message(
                workflow::text::titleArbolex(),
                text::priceOutOfRange(
                    classCaption(i),
                    shell::formatNumber(prices::kMaxAssortmentPrice, kPriceFormat)),
                shell::kExclamation);
            return false;
        }
    }
    m_data.assortmentPrices = typed;
    fillPrices();
    return true;
}

void AssortPricesWindowLogic::cmdChangeAsmtPrices_Click() {
    shell::guard(m_log, windowLabel("cmdChangeAsmtPrices_Click"), [&] {
        if (m_changes && !acceptFields()) {
            return;
        }
        m_changes = !m_changes;
        showChangesState();
    });
}

void AssortPricesWindowLogic::cmdCloseAsmtPrices_Click() {
    shell::guard(m_log, windowLabel("cmdCloseAsmtPrices_Click"), [&] { m_view.close(); });
}

bool AssortPricesWindowLogic::txtAsmtVal_KeyPress(int f, QChar key) const {
    if (!m_changes || f < 0 || f >= rotation::kAssortmentClassCount) {
        return false;
    }
    return priceKeyAccepted(m_view.text(field(f)), key);
}

void AssortPricesWindowLogic::typeText(int f, const QString &typed) {
    if (!txtAsmtVal_KeyPress(f, kBackspace)) {
        return;
    }
    m_view.setText(field(f), typedPrice(typed));
}

bool AssortPricesWindowLogic::press(AssortPricesControl control) {
    switch (control) {
    case AssortPricesControl::cmdChangeAsmtPrices:
        cmdChangeAsmtPrices_Click();
        return true;
    case AssortPricesControl::cmdCloseAsmtPrices:
        cmdCloseAsmtPrices_Click();
        return true;
    default:
        return false;
    }
}

} // namespace arbolex::economics
