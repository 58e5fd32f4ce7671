#pragma once

#include "economics/iassortpricesview.hpp"

#include <map>
#include <utility>

namespace arbolex::economics {

/// An assortment prices window without a screen: it keeps what the logic sets.
class HeadlessAssortPricesView : public IAssortPricesView {
public:
    QString text(AssortPricesItem item) const override {
        const auto found = m_text.find(key(item));
        return found == m_text.end() ? QString() : found->second;
    }
    void setText(AssortPricesItem item, const QString &t) override { m_text[key(item)] = t; }
    void setPricesEditable(bool editable) override { m_editable = editable; }
    void setCaption(const QString &caption) override { m_caption = caption; }
    void showCentred() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    bool pricesEditable() const { return m_editable; }
    QString caption() const { return m_caption; }

private:
    static std::pair<int, int> key(AssortPricesItem item) {
        return {static_cast<int>(item.control), item.index};
    }

    std::map<std::pair<int, int>, QString> m_text;
    bool m_editable = false;
    QString m_caption;
    bool m_shown = false;
};

} // namespace arbolex::economics
