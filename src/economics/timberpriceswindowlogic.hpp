#pragma once

// The logic of the timber prices window `frmTimberPrices`: the four price
// lists side by side, the choice of the prices in use, and the editing of the
// user-defined prices between "Allow Changes" and "Accept Changes".

#include "economics/itimberpricesview.hpp"
#include "prices/prices.hpp"

#include <QChar>
#include <QString>

namespace arbolex::shell {
class ErrorLog;
}

namespace arbolex::economics {

class AssortPricesWindowLogic;
class CarbonPriceWindowLogic;

class TimberPricesWindowLogic {
public:
    TimberPricesWindowLogic(prices::Prices &prices, shell::ErrorLog &log, ITimberPricesView &view);

    /// The window's load: every caption, the four lists, the option of the
    /// set in use and the caption of `cmdChangePrices` for the price changes flag.
    void Form_Load();
    /// Loads the window afresh and shows it; what was typed and not accepted is gone.
    void show();
    /// Writes every list into its block of fields, "#0.00", negative prices in red.
    void FillPriceFields();

    /// "Allow Changes": the user fields take typing. "Accept Changes": the
    /// user fields become the user-defined prices, an empty field counting "0".
    void cmdChangePrices_Click();
    void OptCurentPrices_Click();
    void OptUserPrices_Click();
    void OptNPVprices_Click();
    void OptOvraPrices_Click();
    void cmdClosePricesList_Click();
    /// Opens the assortment prices window, once one is attached.
    void cmdAssortPrices_Click();
    void attachAssortmentPrices(AssortPricesWindowLogic *window) { m_assortPrices = window; }
    /// Opens the carbon price window, once one is attached.
    void cmdCarbonPrice_Click();
    void attachCarbonPrice(CarbonPriceWindowLogic *window) { m_carbonPrice = window; }

    /// Key filter of price field `field` (0 to 51); `key` is the typed
    /// character, '\b' for Backspace. Only the user fields (13 to 25) take
    /// keys, and only while the price changes flag is set: digits, Backspace
    /// and one decimal point.
    bool txtTimbVal_KeyPress(int field, QChar key) const;
    /// Types `text` into price field `field` as a user would: the field's
    /// text is selected and erased with Backspace, then each character goes
    /// through the key filter. An empty `text` empties the field.
    void typeText(int field, const QString &text);
    /// Presses an option button or a command; false when `control` is neither.
    bool press(TimberPricesControl control);

    /// The price set an option button chooses, as numbered for the prices in use.
    static prices::PriceSet priceSetOf(TimberPricesControl option);
    /// The option button of a price set.
    static TimberPricesControl optionOf(prices::PriceSet set);

    ITimberPricesView &view() { return m_view; }

private:
    void selectPrices(prices::PriceSet set, const char *label);
    /// Checks the option button of `set` and clears the others.
    void checkOption(prices::PriceSet set);
    void showChangesState();

    prices::Prices &m_prices;
    shell::ErrorLog &m_log;
    ITimberPricesView &m_view;
    AssortPricesWindowLogic *m_assortPrices = nullptr;
    CarbonPriceWindowLogic *m_carbonPrice = nullptr;
};

} // namespace arbolex::economics
