#pragma once

// The logic of the carbon price window `frmCarbonPrice`: the carbon price and
// how it is paid, edited between "Allow Changes" and "Accept Changes" as the
// assortment prices are, and the constants of the carbon account with their
// sources, read only (they are changed in the data folder's carbon file).

#include "economics/icarbonpriceview.hpp"
#include "prices/pricedata.hpp"

#include <QChar>
#include <QString>

#include <functional>

namespace arbolex::shell {
class ErrorLog;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::economics {

class CarbonPriceWindowLogic {
public:
    CarbonPriceWindowLogic(prices::PriceData &data, shell::ErrorLog &log, ICarbonPriceView &view,
                           shell::IInteractive &interactive);

    /// The window's load: captions, the price ("#0.00"), the payment's option,
    /// the constants and the caption of `cmdChangeCarbonPrice` for the
    /// changes flag.
    void Form_Load();
    /// Loads the window afresh and shows it; what was typed and not accepted is gone.
    void show();

    /// "Allow Changes": the price takes typing and the payment may be chosen.
    /// "Accept Changes": the field becomes the price, an empty field counting
    /// "0", with the payment chosen; a price above the highest is refused
    /// with a message and nothing is changed.
    void cmdChangeCarbonPrice_Click();
    void cmdCloseCarbonPrice_Click();
    /// A payment option chosen: only while changes are allowed.
    void choosePayment(CarbonPriceControl option);

    /// Key filter of the price field; `key` is the typed character, '\b' for
    /// Backspace. Only while changes are allowed: digits, Backspace and one
    /// decimal point.
    bool txtCarbonPrice_KeyPress(QChar key) const;
    /// Types `text` into the price field as a user would, through the key
    /// filter, after erasing what it held. An empty `text` empties the field.
    void typeText(const QString &text);
    /// Presses a command or a payment option; false when `control` is neither.
    bool press(CarbonPriceControl control);

    bool changesAllowed() const { return m_changes; }
    /// Called once accepted settings differ from those before (the economics
    /// window then values its rotation again).
    void onChanged(std::function<void()> handler) { m_changed = std::move(handler); }
    ICarbonPriceView &view() { return m_view; }

private:
    void fillFields();
    void showChangesState();
    /// Stores the field and the option as the pricing; false (after the
    /// message) when the price is out of range.
    bool acceptFields();

    prices::PriceData &m_data;
    shell::ErrorLog &m_log;
    ICarbonPriceView &m_view;
    shell::IInteractive &m_interactive;
    bool m_changes = false;
    std::function<void()> m_changed;
};

} // namespace arbolex::economics
