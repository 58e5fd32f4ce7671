#pragma once

#include "workflow/imainview.hpp"

#include <array>

namespace arbolex::workflow {

/// A main window without a screen: it keeps what the logic sets, so the
/// headless runner and the tests can read it back.
class HeadlessMainView : public IMainView {
public:
    HeadlessMainView() { m_enabled.fill(true); }

    QString text(MainControl c) const override { return m_text.at(index(c)); }
    void setText(MainControl c, const QString &t) override { m_text.at(index(c)) = t; }
    void setEnabled(MainControl c, bool e) override { m_enabled.at(index(c)) = e; }
    void setHint(MainControl c, const QString &h) override { m_hint.at(index(c)) = h; }
    void focus(MainControl c) override { m_focus = c; }
    void setCaption(const QString &caption) override { m_caption = caption; }
    void setBusy(bool busy) override { m_busy = busy; }
    void tableChanged(int /*firstRow*/) override {}
    void scrollToRow(int row) override { m_topRow = row; }
    void setActiveModel(int modelId) override { m_activeModel = modelId; }
    void showSummary(bool summary) override { m_summaryShown = summary; }
    QRect placement() const override { return m_placement; }
    void setPlacement(const QRect &p) override { m_placement = p; }

    bool isEnabled(MainControl c) const override { return m_enabled.at(index(c)); }
    QString hint(MainControl c) const { return m_hint.at(index(c)); }
    MainControl focused() const { return m_focus; }
    QString caption() const override { return m_caption; }
    bool busy() const { return m_busy; }
    int topRow() const { return m_topRow; }
    int activeModel() const { return m_activeModel; }
    bool summaryShown() const { return m_summaryShown; }

private:
    static std::size_t index(MainControl c) { return static_cast<std::size_t>(c); }

    std::array<QString, kMainControlCount> m_text;
    std::array<QString, kMainControlCount> m_hint;
    std::array<bool, kMainControlCount> m_enabled{};
    MainControl m_focus = MainControl::txtFromA;
    QString m_caption;
    bool m_busy = false;
    int m_topRow = 0;
    int m_activeModel = -1;
    bool m_summaryShown = false;
    QRect m_placement{100, 100, 1100, 720};
};

} // namespace arbolex::workflow
