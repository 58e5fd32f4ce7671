#pragma once

// The logic of the assortment prices window `frmAssortPrices`: the price of
// each top-diameter class beside its caption, edited between "Allow Changes"
// and "Accept Changes" as the user's own timber prices are.

#include "economics/iassortpricesview.hpp"
#include "prices/pricedata.hpp"

#include <QChar>
#include <QString>

namespace arbolex::shell {
class ErrorLog;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::economics {

class AssortPricesWindowLogic {
public:
    AssortPricesWindowLogic(prices::PriceData &data, shell::ErrorLog &log, IAssortPricesView &view,
                            shell::IInteractive &interactive);

    /// The window's load: captions, the prices ("#0.00") and the caption of
    /// `cmdChangeAsmtPrices` for the changes flag.
    void Form_Load();
    /// Loads the window afresh and shows it; what was typed and not accepted is gone.
    void show();

    /// "Allow Changes": the fields take typing. "Accept Changes": the fields
    /// become the prices, an empty field counting "0"; a price above the
    /// highest is refused with a message and nothing is changed.
    void cmdChangeAsmtPrices_Click();
    void cmdCloseAsmtPrices_Click();

    /// Key filter of price field `field` (0 to 2); `key` is the typed
    /// character, '\b' for Backspace. Only while changes are allowed: digits,
    /// Backspace and one decimal point.
    bool txtAsmtVal_KeyPress(int field, QChar key) const;
    /// Types `text` into price field `field` as a user would, through the key
    /// filter, after erasing what it held. An empty `text` empties the field.
    void typeText(int field, const QString &text);
    /// Presses a command; false when `control` is not one.
    bool press(AssortPricesControl control);

    bool changesAllowed() const { return m_changes; }
    IAssortPricesView &view() { return m_view; }

private:
    void fillPrices();
    void showChangesState();
    /// Stores the fields as the prices; false (after the message) when one is out of range.
    bool acceptFields();

    prices::PriceData &m_data;
    shell::ErrorLog &m_log;
    IAssortPricesView &m_view;
    shell::IInteractive &m_interactive;
    bool m_changes = false;
};

} // namespace arbolex::economics
