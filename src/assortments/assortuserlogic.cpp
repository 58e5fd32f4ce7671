#include "assortments/assortuserlogic.hpp"

#include "assortments/assortmessages.hpp"
#include "prices/pricedata.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::assortments {

namespace {
constexpr float kSmallestSmallEnd = 7.0f;
} // namespace

AssortUserLogic::AssortUserLogic(prices::PriceData &data, AssortmentSession &session,
                                 IAssortUserView &view, shell::IInteractive &interactive)
    : m_data(data), m_session(session), m_view(view), m_interactive(interactive) {}

void AssortUserLogic::mnuAssortUser_Click() {
    for (int i = 1; i <= prices::kUserCategoryCount; ++i) {
        const prices::UserCategory &c = m_data.categories.at(static_cast<std::size_t>(i - 1));
        m_view.setText(AssortUserControl::txtName, i, c.name);
        m_view.setText(AssortUserControl::txtSmall, i, shell::singleText(c.smallEnd));
        m_view.setText(AssortUserControl::txtBig, i, shell::singleText(c.bigEnd));
        m_view.setChecked(AssortUserControl::chkUse, i, c.inUse);
    }
    m_view.setChecked(AssortUserControl::chkUserCategories, 0, m_session.userCategories);
    m_view.showEditor();
}

bool AssortUserLogic::refuse(int index, const QString &name, const QString &why,
                             AssortUserControl focus) {
    m_interactive.message(workflow::text::titleArbolex(), text::categoryLead(index, name) + why,
                          shell::kExclamation);
    m_view.focus(focus, index);
    return false;
}

void AssortUserLogic::cmdOK_Click() {
    std::array<prices::UserCategory, prices::kUserCategoryCount> edited;
    for (int i = 1; i <= prices::kUserCategoryCount; ++i) {
        prices::UserCategory &c = edited.at(static_cast<std::size_t>(i - 1));
        c.name = m_view.text(AssortUserControl::txtName, i).trimmed();
        c.inUse = m_view.isChecked(AssortUserControl::chkUse, i);
        const QString small = m_view.text(AssortUserControl::txtSmall, i).trimmed();
        const QString big = m_view.text(AssortUserControl::txtBig, i).trimmed();
        bool okSmall = true;
        bool okBig = true;
        c.smallEnd = small.isEmpty() ? 0.0f : small.toFloat(&okSmall);
        c.bigEnd = big.isEmpty() ? 0.0f : big.toFloat(&okBig);
        if (!okSmall || !okBig) {
            refuse(i, c.name, text::notANumber(),
                   okSmall ? AssortUserControl::txtBig : AssortUserControl::txtSmall);
            return;
        }
        // An undefined category (small end 0) that is not in use is left as it is.
        if (c.smallEnd == 0.0f && !c.inUse) {
            continue;
        }
        if (c.smallEnd < 0.0f || c.bigEnd < 0.0f) {
            refuse(i, c.name, text::negativeDiameter(),
                   c.smallEnd < 0.0f ? AssortUserControl::txtSmall : AssortUserControl::txtBig);
            return;
        }
        if (c.smallEnd < kSmallestSmallEnd) {
            refuse(i, c.name, text::smallEndUnder7(), AssortUserControl::txtSmall);
            return;
        }
        if (c.bigEnd != 0.0f && c.bigEnd <= c.smallEnd) {
            refuse(i, c.name, text::bigEndNotAbove(), AssortUserControl::txtBig);
            return;
        }
    }
    m_data.categories = edited;
    m_session.userCategories = m_view.isChecked(AssortUserControl::chkUserCategories, 0);
    m_view.close();
}

void AssortUserLogic::cmdCancel_Click() {
    m_view.close();
}

void AssortUserLogic::typeText(AssortUserControl control, int index, const QString &text) {
    m_view.setText(control, index, text);
}

bool AssortUserLogic::press(AssortUserControl control, int index) {
    switch (control) {
    case AssortUserControl::cmdOK:
        cmdOK_Click();
        return true;
    case AssortUserControl::cmdCancel:
        cmdCancel_Click();
        return true;
    case AssortUserControl::chkUse:
    case AssortUserControl::chkUserCategories:
        m_view.setChecked(control, index, !m_view.isChecked(control, index));
        return true;
    default:
        return false;
    }
}

} // namespace arbolex::assortments
