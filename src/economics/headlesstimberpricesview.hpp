#pragma once

#include "economics/itimberpricesview.hpp"

#include <array>
#include <map>
#include <utility>

namespace arbolex::economics {

/// A timber prices window without a screen: it keeps what the logic sets.
class HeadlessTimberPricesView : public ITimberPricesView {
public:
    QString text(TimberPricesItem item) const override {
        const auto found = m_text.find(key(item));
        return found == m_text.end() ? QString() : found->second;
    }
    void setText(TimberPricesItem item, const QString &t) override { m_text[key(item)] = t; }
    void setNegative(int field, bool negative) override {
        m_negative.at(static_cast<std::size_t>(field)) = negative;
    }
    bool isChecked(TimberPricesControl option) const override {
        return m_checked.at(static_cast<std::size_t>(option));
    }
    void setChecked(TimberPricesControl option, bool on) override {
        m_checked.at(static_cast<std::size_t>(option)) = on;
    }
    void setUserPricesEditable(bool editable) override { m_editable = editable; }
    void setCaption(const QString &caption) override { m_caption = caption; }
    void showCentred() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    bool isNegative(int field) const { return m_negative.at(static_cast<std::size_t>(field)); }
    bool userPricesEditable() const { return m_editable; }
    QString caption() const { return m_caption; }

private:
    static std::pair<int, int> key(TimberPricesItem item) {
        return {static_cast<int>(item.control), item.index};
    }

    std::map<std::pair<int, int>, QString> m_text;
    std::array<bool, kPriceFieldCount> m_negative{};
    std::array<bool, kTimberPricesControlCount> m_checked{};
    bool m_editable = false;
    QString m_caption;
    bool m_shown = false;
};

} // namespace arbolex::economics
