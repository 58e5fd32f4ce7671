#pragma once

// The logic of the user categories window `frmAssortUser`: the five
// categories (name, small-end and big-end diameter, in use) and the switch
// that builds reports over them. Bad bounds are refused with a "FAULT - "
// message that names the category, and nothing changes.

#include "assortments/assortmentsession.hpp"
#include "assortments/iassortview.hpp"

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::prices {
struct PriceData;
}

namespace arbolex::assortments {

class AssortUserLogic {
public:
    AssortUserLogic(prices::PriceData &data, AssortmentSession &session, IAssortUserView &view,
                    shell::IInteractive &interactive);

    /// Fills the window from the categories and the switch, and shows it.
    void mnuAssortUser_Click();
    /// Checks every category and, when all are good, keeps them and closes.
    void cmdOK_Click();
    void cmdCancel_Click();

    /// Types `text` into a field (name, small end, big end of category `index`).
    void typeText(AssortUserControl control, int index, const QString &text);
    /// Presses a command or flips a check box; false when there is no such control.
    bool press(AssortUserControl control, int index);

private:
    bool refuse(int index, const QString &name, const QString &why, AssortUserControl focus);

    prices::PriceData &m_data;
    AssortmentSession &m_session;
    IAssortUserView &m_view;
    shell::IInteractive &m_interactive;
};

} // namespace arbolex::assortments
