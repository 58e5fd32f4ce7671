// The model choice window: the drawn introduction without media files, the
// initial selection and the hand-over of the chosen model to the main window.
#include "guifixture.hpp"

#include "ui/introillustration.hpp"
#include "ui/modelchoicedialog.hpp"

#include <QImage>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QSet>

namespace arbolex::testing {
namespace {

using ModelChoiceTest = MainWindowGuiTest;

TEST_F(ModelChoiceTest, WithoutMediaFilesShowsTheDrawnIllustration) {
    ui::ModelChoiceDialog choice(window, dir.path(), 0);
    choice.show();
    ASSERT_NE(choice.illustration(), nullptr);
    EXPECT_EQ(choice.introduction(), choice.illustration());
    EXPECT_TRUE(choice.illustration()->isVisible());

    // A picture, not an empty panel: sky, hillside, trees and the curve.
    const QImage drawn = choice.illustration()->grab().toImage();
    ASSERT_FALSE(drawn.isNull());
    QSet<QRgb> colours;
    for (int y = 0; y < drawn.height(); y += 4) {
        for (int x = 0; x < drawn.width(); x += 4) {
            colours.insert(drawn.pixel(x, y));
        }
    }
    EXPECT_GT(colours.size(), 50);
}

TEST_F(ModelChoiceTest, PicturesOfTheDataFolderReplaceTheDrawing) {
    // Pictures of our own in the places the introduction looks for them.
    QImage picture(64, 48, QImage::Format_RGB32);
    picture.fill(Qt::darkGreen);
    ASSERT_TRUE(QDir(dir.path()).mkpath(QStringLiteral("SpruceImages")));
    ASSERT_TRUE(picture.save(dir.filePath(QStringLiteral("Spruce_Complete.jpg"))));
    ASSERT_TRUE(picture.save(dir.filePath(QStringLiteral("SpruceImages/Spruce_01.jpg"))));

    ui::ModelChoiceDialog choice(window, dir.path(), 0);
    choice.show();
    auto *complete = choice.findChild<QLabel *>(QStringLiteral("imgComplete"));
    auto *sequence = choice.findChild<QLabel *>(QStringLiteral("imgSequence"));
    ASSERT_NE(complete, nullptr);
    ASSERT_NE(sequence, nullptr);
    EXPECT_EQ(choice.introduction(), complete);
    EXPECT_FALSE(complete->pixmap().isNull());
    EXPECT_TRUE(sequence->isVisible());
    EXPECT_FALSE(sequence->pixmap().isNull());
    // Both pictures find room inside the window.
    EXPECT_LE(sequence->geometry().bottom(), choice.rect().bottom());
    EXPECT_LE(complete->parentWidget()->geometry().bottom(), sequence->geometry().top());
}

TEST_F(ModelChoiceTest, AcceptHandsTheSelectedModelToTheMainWindow) {
    ui::ModelChoiceDialog choice(window, dir.path(), 7);
    EXPECT_EQ(choice.selectedModel(), 7);
    auto *models = choice.findChild<QListWidget *>();
    ASSERT_NE(models, nullptr);
    ASSERT_EQ(models->count(), engine::kModelCount);
    models->setCurrentRow(12);

    auto *accept = choice.findChild<QPushButton *>(QStringLiteral("cmdGoToMain"));
    ASSERT_NE(accept, nullptr);
    accept->click();
    EXPECT_EQ(grow.modelId(), 12);
    EXPECT_TRUE(window.isVisible());
    EXPECT_EQ(choice.result(), QDialog::Accepted);
}

TEST_F(ModelChoiceTest, ClosingWithoutAcceptingLeavesTheMainWindowHidden) {
    ui::ModelChoiceDialog choice(window, dir.path(), 4);
    choice.show();
    choice.reject();
    EXPECT_EQ(choice.result(), QDialog::Rejected);
    EXPECT_FALSE(window.isVisible());
    EXPECT_EQ(grow.modelId(), 0); // the model of the start-up file stays
}

} // namespace
} // namespace arbolex::testing
