// The base of the tool windows over the main window: Escape and the title
// bar's close button go to the logic's own closing command and nowhere else,
// and the keys typed into the watched fields pass the window's filter with
// the field's index.
#include "guifixture.hpp"

#include "ui/toolwindow.hpp"

#include <QKeyEvent>
#include <QLineEdit>
#include <QVBoxLayout>

namespace arbolex::testing {
namespace {

class IFakeToolView {
public:
    virtual ~IFakeToolView() = default;
    virtual void setCaption(const QString &caption) = 0;
    virtual void showCentred() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

/// A logic whose closing command may leave the window open (a question the
/// user answered No).
struct FakeToolLogic {
    IFakeToolView *view = nullptr;
    bool closes = true;
    int closings = 0;

    void cmdClose_Click() {
        ++closings;
        if (closes) {
            view->close();
        }
    }
};

/// Three watched fields, then one the filter leaves alone; the filter
/// refuses an "x".
class FakeToolWindow : public ui::ToolWindow<IFakeToolView, FakeToolLogic> {
public:
    FakeToolWindow()
        : ToolWindow(nullptr, QStringLiteral("frmFake"), QStringLiteral("Fake"),
                     &FakeToolLogic::cmdClose_Click) {
        auto *layout = new QVBoxLayout(this);
        for (QLineEdit *&field : fields) {
            field = new QLineEdit(this);
            layout->addWidget(field);
            indices.push_back(watchKeys(field));
        }
        other = new QLineEdit(this);
        layout->addWidget(other);
    }

    std::array<QLineEdit *, 3> fields{};
    QLineEdit *other = nullptr;
    std::vector<int> indices;
    /// Every key the filter was asked about: the field's index and the text.
    std::vector<std::pair<int, QString>> asked;

protected:
    bool refusesKey(int field, const QKeyEvent &key) override {
        asked.emplace_back(field, key.text());
        return key.text() == QStringLiteral("x");
    }
};

TEST(ToolWindowTest, EscapeAndTheCloseButtonRunTheLogicsClosingCommandOnly) {
    FakeToolWindow window;
    FakeToolLogic logic;
    logic.view = &window;

    // Before there is a logic, Escape is a plain dialog's.
    window.show();
    pressKey(&window, Qt::Key_Escape);
    EXPECT_FALSE(window.isVisible());

    window.attach(logic);
    window.showCentred();
    pressKey(&window, Qt::Key_Escape);
    EXPECT_EQ(logic.closings, 1);
    EXPECT_FALSE(window.isShown());

    window.show();
    static_cast<QWidget &>(window).close(); // the title bar's close button
    EXPECT_EQ(logic.closings, 2);
    EXPECT_FALSE(window.isVisible());
    static_cast<QWidget &>(window).close();
    EXPECT_EQ(logic.closings, 2) << "a hidden window has nothing to close";

    // The window stays open when the logic's command keeps it open.
    logic.closes = false;
    window.show();
    pressKey(&window, Qt::Key_Escape);
    EXPECT_EQ(logic.closings, 3);
    EXPECT_TRUE(window.isVisible());
}

TEST(ToolWindowTest, KeysOfWatchedFieldsPassTheFilterWithTheFieldsIndex) {
    FakeToolWindow window;
    FakeToolLogic logic;
    logic.view = &window;
    window.attach(logic);
    window.show();
    EXPECT_EQ(window.indices, (std::vector<int>{0, 1, 2}));

    typeKeys(window.fields[2], QStringLiteral("4x2"));
    EXPECT_EQ(window.fields[2]->text(), QStringLiteral("42"));
    typeKeys(window.fields[0], QStringLiteral("1"));
    EXPECT_EQ(window.asked, (std::vector<std::pair<int, QString>>{{2, QStringLiteral("4")},
                                                                  {2, QStringLiteral("x")},
                                                                  {2, QStringLiteral("2")},
                                                                  {0, QStringLiteral("1")}}));
    // Any other widget of the window takes every key unasked.
    typeKeys(window.other, QStringLiteral("x"));
    EXPECT_EQ(window.other->text(), QStringLiteral("x"));
    EXPECT_EQ(window.asked.size(), 4U);
}

} // namespace
} // namespace arbolex::testing
