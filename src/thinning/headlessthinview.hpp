#pragma once

#include "thinning/ithinview.hpp"

#include <array>

namespace arbolex::thinning {

/// A thinning window without a screen: it keeps what the logic sets.
class HeadlessThinView : public IThinView {
public:
    HeadlessThinView() { m_enabled.fill(true); }

    QString text(ThinControl c) const override { return m_text.at(index(c)); }
    void setText(ThinControl c, const QString &t) override { m_text.at(index(c)) = t; }
    void setEnabled(ThinControl c, bool e) override { m_enabled.at(index(c)) = e; }
    bool isChecked(ThinControl c) const override { return m_checked.at(index(c)); }
    void setChecked(ThinControl c, bool on) override { m_checked.at(index(c)) = on; }
    void focus(ThinControl c) override { m_focus = c; }
    void setCaption(const QString &caption) override { m_caption = caption; }
    void showCentred() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    bool isEnabled(ThinControl c) const { return m_enabled.at(index(c)); }
    ThinControl focused() const { return m_focus; }
    QString caption() const { return m_caption; }

private:
    static std::size_t index(ThinControl c) { return static_cast<std::size_t>(c); }

    std::array<QString, kThinControlCount> m_text;
    std::array<bool, kThinControlCount> m_enabled{};
    std::array<bool, kThinControlCount> m_checked{};
    ThinControl m_focus = ThinControl::txtRemB;
    QString m_caption;
    bool m_shown = false;
};

} // namespace arbolex::thinning
