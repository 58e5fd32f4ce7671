#pragma once

#include "economics/npvcontrols.hpp"

#include <QString>

#include <array>

namespace arbolex::economics {

/// What the net present value window's logic may read and change in its window.
class INpvView {
public:
    virtual ~INpvView() = default;
    virtual QString text(NpvControl control) const = 0;
    virtual void setText(NpvControl control, const QString &text) = 0;
    virtual void focus(NpvControl control) = 0;
    /// The grid's texts changed (cells, or the number of rows).
    virtual void gridChanged() = 0;
    /// The current cell of `NPV_Grid` moved to (row, column); row 0 is the header.
    virtual void setCurrentCell(int row, int column) = 0;
    /// Widens the grid by the room of its vertical scroll bar.
    virtual void setGridWidened(bool widened) = 0;
    /// Shows the window (not modal).
    virtual void showWindow() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

/// A net present value window without a screen: it keeps what the logic sets.
class HeadlessNpvView : public INpvView {
public:
    QString text(NpvControl c) const override { return m_text.at(index(c)); }
    void setText(NpvControl c, const QString &t) override { m_text.at(index(c)) = t; }
    void focus(NpvControl c) override { m_focus = c; }
    void gridChanged() override { ++m_gridChanges; }
    void setCurrentCell(int row, int column) override {
        m_row = row;
        m_column = column;
    }
    void setGridWidened(bool widened) override { m_widened = widened; }
    void showWindow() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    NpvControl focused() const { return m_focus; }
    int gridChanges() const { return m_gridChanges; }
    bool widened() const { return m_widened; }

private:
    static std::size_t index(NpvControl c) { return static_cast<std::size_t>(c); }

    std::array<QString, kNpvControlCount> m_text;
    NpvControl m_focus = NpvControl::txtInterestRate;
    int m_gridChanges = 0;
    int m_row = 0;
    int m_column = 0;
    bool m_widened = false;
    bool m_shown = false;
};

} // namespace arbolex::economics
