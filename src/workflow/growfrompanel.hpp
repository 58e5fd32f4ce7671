#pragma once

// The grow-from panel of the main window: its fields as the user types them
// (kept in the work, shown by the window), the key filter, the lost-focus
// handlers that show the site index, and the form and range checks of the
// grow command with their messages.

#include "work/worksnapshot.hpp"
#include "workflow/maincontrols.hpp"

#include <QMetaObject>
#include <QString>

namespace arbolex::engine {
class Grow;
}

namespace arbolex::shell {
class ErrorLog;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::work {
class StandWork;
}

namespace arbolex::workflow {

class IMainView;

/// The grow-from values as read from the fields.
struct GrowFrom {
    float age = 0.0f;       ///< years
    float stocking = 0.0f;  ///< stems/ha
    float topHeight = 0.0f; ///< m
    float basalArea = 0.0f; ///< m²/ha
    float dbh = 0.0f;       ///< cm
    float targetAge = 0.0f; ///< years
    float step = 0.0f;      ///< years
};

class GrowFromPanel {
public:
    /// Shows the fields of `work` in `view` and keeps them shown as they change.
    GrowFromPanel(work::StandWork &work, engine::Grow &grow, shell::ErrorLog &log, IMainView &view,
                  shell::IInteractive &interactive);
    ~GrowFromPanel();
    GrowFromPanel(const GrowFromPanel &) = delete;
    GrowFromPanel &operator=(const GrowFromPanel &) = delete;

    /// The key filter of every numeric field: digits and the decimal point
    /// pass; any other character is discarded.
    static bool KeyFilter(QChar key);
    /// Types `text` into a field as a user would (each character of a numeric
    /// field through the key filter), then leaves it.
    void typeText(MainControl control, const QString &text);
    /// The window's field holds `text` after the user edited it.
    void fieldEdited(MainControl control, const QString &text);
    /// Leaving a field runs its lost-focus handler.
    void leaveField(MainControl control);
    void txtFromA_LostFocus();
    void txtFromH_LostFocus();
    /// The site index of (age, top height) in `lblSI`.
    void showSiteIndex(float age, float topHeight);
    /// The engine's site index in `lblSI`, or nothing when it is not `known`.
    void showSiteIndex(bool known);

    bool ChkGrowFromFlds();
    bool ChkGrowFromBnds();
    bool ChkGrowFromBD();
    GrowFrom GetGrowFrom() const;

    /// Text of a field as the work keeps it.
    const QString &field(MainControl control) const;

private:
    bool refuse(const QString &title, const QString &text, int style, MainControl control);

    work::StandWork &m_work;
    engine::Grow &m_grow;
    shell::ErrorLog &m_log;
    IMainView &m_view;
    shell::IInteractive &m_interactive;
    QMetaObject::Connection m_fieldShown;
    QMetaObject::Connection m_siteIndexShown;
};

} // namespace arbolex::workflow
