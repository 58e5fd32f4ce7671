#pragma once

#include "assortments/iassortview.hpp"
#include "prices/pricedata.hpp"

#include <array>
#include <optional>

namespace arbolex::assortments {

/// A report window without a screen: it keeps what the logic sets.
class HeadlessAssortView : public IAssortView {
public:
    QString text(AssortControl c) const override { return m_text.at(index(c)); }
    void setText(AssortControl c, const QString &t) override { m_text.at(index(c)) = t; }
    void setCaption(const QString &caption) override { m_caption = caption; }
    void showFixedClasses() override { m_userReport.reset(); }
    void showUserReport(const UserReport &report) override { m_userReport = report; }
    void showReport() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    QString caption() const override { return m_caption; }
    /// The user report on show, if any.
    std::optional<UserReport> userReport() const override { return m_userReport; }

private:
    static std::size_t index(AssortControl c) { return static_cast<std::size_t>(c); }

    std::array<QString, kAssortControlCount> m_text;
    QString m_caption;
    std::optional<UserReport> m_userReport;
    bool m_shown = false;
};

/// A user categories window without a screen.
class HeadlessAssortUserView : public IAssortUserView {
public:
    QString text(AssortUserControl c, int i) const override { return m_text.at(slot(c, i)); }
    void setText(AssortUserControl c, int i, const QString &t) override {
        m_text.at(slot(c, i)) = t;
    }
    bool isChecked(AssortUserControl c, int i) const override { return m_checked.at(slot(c, i)); }
    void setChecked(AssortUserControl c, int i, bool on) override { m_checked.at(slot(c, i)) = on; }
    void focus(AssortUserControl c, int i) override { m_focus = {c, i}; }
    void showEditor() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    AssortUserControlRef focused() const { return m_focus; }

private:
    static constexpr std::size_t kSlots = 6; // index 0 and categories 1 to 5
    static std::size_t slot(AssortUserControl c, int i) {
        return static_cast<std::size_t>(c) * kSlots + static_cast<std::size_t>(i);
    }

    std::array<QString, kAssortUserControlCount * kSlots> m_text;
    std::array<bool, kAssortUserControlCount * kSlots> m_checked{};
    AssortUserControlRef m_focus;
    bool m_shown = false;
};

} // namespace arbolex::assortments
