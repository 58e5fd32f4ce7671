#pragma once

#include <QDialog>

class QLabel;
class QListWidget;
class QMediaPlayer;
class QPushButton;
class QStackedWidget;
class QTimer;
class QVideoWidget;

namespace arbolex::ui {

class IntroIllustration;
class MainWindow;
class PictureView;

/// The model choice window `frmModelChoice`, shown before the main window: an
/// introduction (the video and pictures of the data folder when they are
/// there, else a drawn illustration) beside the list of the 22 models. Accept
/// hands the chosen model to the main window and shows it.
class ModelChoiceDialog : public QDialog {
    Q_OBJECT
public:
    /// `initialModel` is selected at first (the model of the start-up file).
    ModelChoiceDialog(MainWindow &main, QString dataFolder, int initialModel,
                      QWidget *parent = nullptr);
    ~ModelChoiceDialog() override;

    /// Identifier of the selected model, -1 when none is selected.
    int selectedModel() const;
    /// Accept: the chosen model goes to the main window, which is shown.
    void cmdGoToMain_Click();

    /// What the introduction area shows now.
    QWidget *introduction() const;
    IntroIllustration *illustration() const { return m_illustration; }

    void done(int result) override;

private:
    QString media(const QString &name) const;
    void startIntroduction();
    void videoFinished();
    /// Steps the picture sequence to its next picture, back to the first after the last.
    void nextPicture();
    /// Shows what the selected entry is in the description below the list.
    void describeSelection();

    MainWindow &m_main;
    QString m_dataFolder;

    QStackedWidget *m_intro = nullptr;
    IntroIllustration *m_illustration = nullptr;
    QVideoWidget *m_video = nullptr;
    PictureView *m_picture = nullptr;
    PictureView *m_sequence = nullptr;
    QListWidget *m_models = nullptr;
    QLabel *m_description = nullptr;
    QPushButton *m_accept = nullptr;

    QMediaPlayer *m_player = nullptr;
    QTimer *m_sequenceTimer = nullptr;
    int m_sequenceNumber = 0;
};

} // namespace arbolex::ui
