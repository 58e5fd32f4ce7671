// The timber prices window wired to its logic and to the main window: Show
// Timber Prices, keys in the price fields, accept, the option buttons and the
// red of a negative price.
#include "guifixture.hpp"

#include "economics/timberpriceswindowlogic.hpp"
#include "ui/timberpriceswindow.hpp"

#include <QRadioButton>

namespace arbolex::testing {
namespace {

using economics::TimberPricesControl;

class TimberPricesGuiTest : public MainWindowGuiTest {
protected:
    TimberPricesGuiTest() { window.show(); }

    QLineEdit *priceField(int index) const {
        return qobject_cast<QLineEdit *>(
            pricesWindow.control({TimberPricesControl::txtTimbVal, index}));
    }
    QWidget *single(TimberPricesControl c) const { return pricesWindow.control({c, 0}); }

    /// Selects the field's text and types `keys` over it.
    void typeOver(int index, const QString &keys) {
        QLineEdit *edit = priceField(index);
        edit->selectAll();
        typeKeys(edit, keys);
    }

    ui::TimberPricesWindow &pricesWindow = desktop.pricesWindow();
    economics::TimberPricesWindowLogic &pricesLogic = session.timberPrices();
};

TEST_F(TimberPricesGuiTest, ShowTimberPricesOpensTheListsBesideTheirClasses) {
    click(window.control(MainControl::cmdShowTimberPrice));
    ASSERT_TRUE(pricesWindow.isVisible());
    EXPECT_EQ(priceField(0)->text(), QStringLiteral("4.10"));
    EXPECT_EQ(priceField(26)->text(), QStringLiteral("3.85"));
    EXPECT_TRUE(
        qobject_cast<QRadioButton *>(single(TimberPricesControl::OptCurentPrices))->isChecked());
    // Every price is level with its class caption.
    for (int f = 0; f < economics::kPriceFieldCount; ++f) {
        const QWidget *caption =
            pricesWindow.control({TimberPricesControl::lblTimbCat, f % prices::kPriceClassCount});
        const int fieldMiddle =
            priceField(f)->mapTo(&pricesWindow, priceField(f)->rect().center()).y();
        const int captionMiddle = caption->mapTo(&pricesWindow, caption->rect().center()).y();
        EXPECT_LE(std::abs(fieldMiddle - captionMiddle), 1) << "field " << f;
    }
    click(single(TimberPricesControl::cmdClosePricesList));
    EXPECT_FALSE(pricesWindow.isVisible());
}

TEST_F(TimberPricesGuiTest, KeysReachOnlyTheUserPricesAfterAllowChanges) {
    click(window.control(MainControl::cmdShowTimberPrice));
    typeOver(13, QStringLiteral("7"));
    EXPECT_EQ(priceField(13)->text(), QStringLiteral("4.00"));

    click(single(TimberPricesControl::cmdChangePrices));
    typeOver(13, QStringLiteral("1a2.5.-9"));
    EXPECT_EQ(priceField(13)->text(), QStringLiteral("12.59"));
    priceField(14)->selectAll();
    pressKey(priceField(14), Qt::Key_Backspace);
    EXPECT_EQ(priceField(14)->text(), QString());
    for (const int other : {0, 26, 51}) {
        const QString before = priceField(other)->text();
        typeOver(other, QStringLiteral("9"));
        pressKey(priceField(other), Qt::Key_Backspace);
        EXPECT_EQ(priceField(other)->text(), before) << "field " << other;
    }

    click(single(TimberPricesControl::cmdChangePrices));
    EXPECT_EQ(priceField(14)->text(), QStringLiteral("0"));
    EXPECT_DOUBLE_EQ(prices.data().userDefined[0], 12.59);
    EXPECT_EQ(prices.data().userDefined[1], 0.0);
    typeOver(13, QStringLiteral("3"));
    EXPECT_EQ(priceField(13)->text(), QStringLiteral("12.59")) << "accepted: no more typing";
}

TEST_F(TimberPricesGuiTest, OptionButtonsChooseThePricesInUseAndNegativesAreRed) {
    prices.data().privateSector[5] = -26.1;
    click(window.control(MainControl::cmdShowTimberPrice));
    click(single(TimberPricesControl::OptOvraPrices));
    EXPECT_EQ(prices.priceSetInUse(), prices::kPrivatePrices);
    EXPECT_EQ(prices.pricesInUse()[5], 26.1);

    QLineEdit *negative = priceField(39 + 5);
    EXPECT_EQ(negative->text(), QStringLiteral("-26.10"));
    EXPECT_EQ(negative->palette().color(QPalette::Text), QColor(255, 0, 0));
    EXPECT_NE(priceField(39 + 4)->palette().color(QPalette::Text), QColor(255, 0, 0));
}

} // namespace
} // namespace arbolex::testing
