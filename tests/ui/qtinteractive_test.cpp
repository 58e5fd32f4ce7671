// Message boxes: a question that can be cancelled offers Cancel, the CR LF /
// LF CR line breaks of the messages show as line breaks, and a script's
// queued answers answer the questions without a box.
#include "ui/qtinteractive.hpp"

#include <QMessageBox>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using ui::QtInteractive;

TEST(QtInteractiveTest, LineBreaksInEitherOrderBecomeOneBreakEach) {
    EXPECT_EQ(QtInteractive::lineBreaks(QStringLiteral("a\r\nb\n\rc\rd\ne")),
              QStringLiteral("a\nb\nc\nd\ne"));
    EXPECT_EQ(QtInteractive::lineBreaks(QStringLiteral("a\r\n\r\nb")), QStringLiteral("a\n\nb"));
    EXPECT_EQ(QtInteractive::lineBreaks(QStringLiteral("a\n\r\nb")), QStringLiteral("a\n\nb"));
    // Text that only names a line break is shown as it stands.
    EXPECT_EQ(QtInteractive::lineBreaks(QStringLiteral("would be & vbCrLf & equal")),
              QStringLiteral("would be & vbCrLf & equal"));
}

TEST(QtInteractiveTest, AnOkCancelMessageOffersCancel) {
    const auto box =
        QtInteractive::messageBox(nullptr, QStringLiteral("TITLE"), QStringLiteral("one\r\ntwo"),
                                  shell::kExclamationOkCancel);
    EXPECT_EQ(box->standardButtons(), QMessageBox::Ok | QMessageBox::Cancel);
    EXPECT_EQ(box->text(), QStringLiteral("one\ntwo"));
}

// A box left open would wait for a click no script can give: a run that
// quits with unsaved work must be answered from the queue.
TEST(QtInteractiveTest, QueuedAnswersAnswerEveryKindOfQuestionInOrder) {
    QtInteractive interactive;
    interactive.queueAnswer(false);
    interactive.queueAnswer(true);
    interactive.queueAnswer(true);
    EXPECT_EQ(interactive.askSaveDiscardCancel(QStringLiteral("T"), QStringLiteral("unsaved")),
              shell::UnsavedChoice::Discard);
    EXPECT_TRUE(interactive.askYesNo(QStringLiteral("T"), QStringLiteral("sure?")));
    EXPECT_EQ(interactive.askSaveDiscardCancel(QStringLiteral("T"), QStringLiteral("unsaved")),
              shell::UnsavedChoice::Save);
}

} // namespace
} // namespace arbolex::testing
