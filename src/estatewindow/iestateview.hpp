#pragma once

#include <QString>

#include <functional>

namespace arbolex::estatewindow {

/// What the estate window's logic may do to its window.
class IEstateView {
public:
    virtual ~IEstateView() = default;
    /// The estate table to open; empty when cancelled.
    virtual QString chooseEstateFile() = 0;
    /// Rows done of `rowsInInput` (-1 when not known). Called from the worker
    /// thread of the run.
    virtual void setProgress(long long rowsDone, long long rowsInInput) = 0;
    /// Runs `work` away from the window's thread, then `done` on it.
    virtual void runInBackground(std::function<void()> work, std::function<void()> done) = 0;
    /// The results table and the forecast hold a new estate.
    virtual void resultsChanged() = 0;
    virtual void showWindow() = 0;
};

/// An estate window without a screen: it runs the estate at once on the
/// caller's thread and keeps what the logic tells it.
class HeadlessEstateView : public IEstateView {
public:
    QString chooseEstateFile() override { return fileToChoose; }
    void setProgress(long long rowsDone, long long /*rowsInInput*/) override {
        lastProgress = rowsDone;
        if (onProgress) {
            onProgress(rowsDone);
        }
    }
    void runInBackground(std::function<void()> work, std::function<void()> done) override {
        work();
        done();
    }
    void resultsChanged() override { ++resultChanges; }
    void showWindow() override { shown = true; }

    QString fileToChoose;
    long long lastProgress = -1;
    int resultChanges = 0;
    bool shown = false;
    /// Called with every report of progress: a test presses Cancel here.
    std::function<void(long long)> onProgress;
};

} // namespace arbolex::estatewindow
