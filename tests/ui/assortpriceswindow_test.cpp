// The assortment prices window wired to its logic: opened from the timber
// prices window, keys reach the prices only after Allow Changes, and pasting
// never does (closing is the tool window base's, tested with it).
#include "guifixture.hpp"

#include "economics/assortpriceswindowlogic.hpp"
#include "economics/timberpriceswindowlogic.hpp"
#include "ui/assortpriceswindow.hpp"
#include "ui/timberpriceswindow.hpp"

#include <QApplication>
#include <QClipboard>
#include <QKeyEvent>
#include <QPushButton>

namespace arbolex::testing {
namespace {

using economics::AssortPricesControl;

class AssortPricesGuiTest : public MainWindowGuiTest {
protected:
    AssortPricesGuiTest() { window.show(); }

    QLineEdit *priceField(int k) const {
        return qobject_cast<QLineEdit *>(
            assortWindow.control({AssortPricesControl::txtAsmtVal, k}));
    }
    void press(AssortPricesControl c) const { click(assortWindow.control({c, 0})); }

    ui::TimberPricesWindow &pricesWindow = desktop.pricesWindow();
    economics::TimberPricesWindowLogic &pricesLogic = session.timberPrices();
    ui::AssortPricesWindow &assortWindow = desktop.assortPricesWindow();
    economics::AssortPricesWindowLogic &assortLogic = session.assortPrices();
};

TEST_F(AssortPricesGuiTest, OpenedFromTheTimberPricesAndEditedThroughTheKeyFilter) {
    prices.data().assortmentPrices = {10.0, 28.0, 48.0};
    logic.cmdShowTimberPrice_Click();
    click(pricesWindow.control({economics::TimberPricesControl::cmdAssortPrices, 0}));
    ASSERT_TRUE(assortWindow.isVisible());
    EXPECT_EQ(priceField(2)->text(), QStringLiteral("48.00"));

    priceField(2)->selectAll();
    typeKeys(priceField(2), QStringLiteral("5"));
    EXPECT_EQ(priceField(2)->text(), QStringLiteral("48.00")) << "no typing before Allow Changes";

    press(AssortPricesControl::cmdChangeAsmtPrices);
    priceField(2)->selectAll();
    typeKeys(priceField(2), QStringLiteral("5x5.5.0"));
    EXPECT_EQ(priceField(2)->text(), QStringLiteral("55.50"));
    QApplication::clipboard()->setText(QStringLiteral("-1"));
    priceField(1)->selectAll();
    QKeyEvent paste(QEvent::KeyPress, Qt::Key_V, Qt::ControlModifier, QStringLiteral("v"));
    QApplication::sendEvent(priceField(1), &paste);
    EXPECT_EQ(priceField(1)->text(), QStringLiteral("28.00")) << "pasting is refused";
    press(AssortPricesControl::cmdChangeAsmtPrices);
    EXPECT_EQ(prices.data().assortmentPrices[2], 55.5);

    press(AssortPricesControl::cmdCloseAsmtPrices);
    EXPECT_FALSE(assortWindow.isVisible());
}

} // namespace
} // namespace arbolex::testing
