#pragma once

#include "economics/economicscontrols.hpp"

#include <QString>

#include <array>
#include <functional>
#include <vector>

namespace arbolex::economics {

/// What the economics window's logic may read and change in its window.
class IEconomicsView {
public:
    virtual ~IEconomicsView() = default;
    virtual QString text(EconomicsControl control) const = 0;
    virtual void setText(EconomicsControl control, const QString &text) = 0;
    virtual void setEnabled(EconomicsControl control, bool enabled) = 0;
    virtual void focus(EconomicsControl control) = 0;
    /// The figures, the rotation explorer and the tornado changed.
    virtual void figuresChanged() = 0;
    /// The optimiser's regimes changed.
    virtual void regimesChanged() = 0;
    /// The Monte Carlo draws changed.
    virtual void monteCarloChanged() = 0;
    /// Fraction of the optimiser's search done, 0 to 1. May be called from
    /// the thread that runs `work` of runInBackground().
    virtual void setProgress(double fraction) = 0;
    /// Runs `work` away from the window's thread, so the window stays alive
    /// and Cancel can be pressed, then `done` on the window's thread.
    virtual void runInBackground(std::function<void()> work, std::function<void()> done) = 0;
    virtual void showWindow() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

/// An economics window without a screen: it keeps what the logic sets and
/// runs long work at once, on the caller's thread.
class HeadlessEconomicsView : public IEconomicsView {
public:
    HeadlessEconomicsView() { m_enabled.fill(true); }

    QString text(EconomicsControl c) const override { return m_text.at(index(c)); }
    void setText(EconomicsControl c, const QString &t) override { m_text.at(index(c)) = t; }
    void setEnabled(EconomicsControl c, bool e) override { m_enabled.at(index(c)) = e; }
    void focus(EconomicsControl c) override { m_focus = c; }
    void figuresChanged() override { ++m_figureChanges; }
    void regimesChanged() override { ++m_regimeChanges; }
    void monteCarloChanged() override { ++m_monteCarloChanges; }
    void setProgress(double fraction) override {
        m_progress.push_back(fraction);
        if (onProgress) {
            onProgress(fraction);
        }
    }
    void runInBackground(std::function<void()> work, std::function<void()> done) override {
        work();
        done();
    }
    void showWindow() override { m_shown = true; }
    void close() override { m_shown = false; }
    bool isShown() const override { return m_shown; }

    bool isEnabled(EconomicsControl c) const { return m_enabled.at(index(c)); }
    EconomicsControl focused() const { return m_focus; }
    int figureChanges() const { return m_figureChanges; }
    int regimeChanges() const { return m_regimeChanges; }
    const std::vector<double> &progress() const { return m_progress; }
    /// Called with every fraction of progress: a test presses Cancel here.
    std::function<void(double)> onProgress;

private:
    static std::size_t index(EconomicsControl c) { return static_cast<std::size_t>(c); }

    std::array<QString, kEconomicsControlCount> m_text;
    std::array<bool, kEconomicsControlCount> m_enabled{};
    EconomicsControl m_focus = EconomicsControl::txtInterestRate;
    int m_figureChanges = 0;
    int m_regimeChanges = 0;
    int m_monteCarloChanges = 0;
    std::vector<double> m_progress;
    bool m_shown = false;
};

} // namespace arbolex::economics
