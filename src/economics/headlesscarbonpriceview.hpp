#pragma once

#include "economics/icarbonpriceview.hpp"

#include <array>

namespace arbolex::economics {

/// A carbon price window without a screen: it keeps what the logic sets.
class HeadlessCarbonPriceView : public ICarbonPriceView {
public:
    QString text(CarbonPriceControl c) const override { return m_text.at(index(c)); }
    void setText(CarbonPriceControl c, const QString &t) override { m_text.at(index(c)) = t; }
    bool isChecked(CarbonPriceControl c) const override { return m_checked.at(index(c)); }
    void setChecked(CarbonPriceControl c, bool checked) override {
        m_checked.at(index(c)) = checked;
    }
    void setEditable(bool editable) override { m_editable = editable; }
    void setConstants(const std::vector<QStringList> &grid) override { m_constants = grid; }
    void setCaption(const QString &caption) override { m_caption = caption; }
    void showCentred() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    bool editable() const { return m_editable; }
    const std::vector<QStringList> &constants() const { return m_constants; }
    QString caption() const { return m_caption; }

private:
    static std::size_t index(CarbonPriceControl c) { return static_cast<std::size_t>(c); }

    std::array<QString, kCarbonPriceControlCount> m_text;
    std::array<bool, kCarbonPriceControlCount> m_checked{};
    std::vector<QStringList> m_constants;
    bool m_editable = false;
    QString m_caption;
    bool m_shown = false;
};

} // namespace arbolex::economics
