#include "ui/modelchoicedialog.hpp"

#include "engine/catalogue.hpp"
#include "ui/introillustration.hpp"
#include "ui/mainwindow.hpp"
#include "ui/pictureview.hpp"
#include "ui/windowtexts.hpp"

#include <QAudioOutput>
#include <QDir>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QMediaPlayer>
#include <QPushButton>
#include <QStackedWidget>
#include <QTimer>
#include <QVBoxLayout>
#include <QVideoWidget>

namespace arbolex::ui {

namespace {

/// How long each picture of the sequence stays, milliseconds.
constexpr int kPictureInterval = 1500;

} // namespace

ModelChoiceDialog::ModelChoiceDialog(MainWindow &main, QString dataFolder, int initialModel,
                                     QWidget *parent)
    : QDialog(parent), m_main(main), m_dataFolder(std::move(dataFolder)) {
    setObjectName(QStringLiteral("frmModelChoice"));
    setWindowTitle(text::choiceTitle());

    // Introduction: the drawing until media of the data folder replace it.
    auto *introArea = new QVBoxLayout;
    introArea->setSpacing(8);
    m_intro = new QStackedWidget(this);
    m_illustration = new IntroIllustration(m_intro);
    m_intro->addWidget(m_illustration);
    m_picture = new PictureView(m_intro);
    m_picture->setObjectName(QStringLiteral("imgComplete"));
    m_intro->addWidget(m_picture);
    m_intro->setCurrentWidget(m_illustration);
    introArea->addWidget(m_intro, 1);
    m_sequence = new PictureView(this);
    m_sequence->setObjectName(QStringLiteral("imgSequence"));
    m_sequence->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
    m_sequence->setFixedHeight(120);
    m_sequence->hide();
    introArea->addWidget(m_sequence);

    auto *heading = new QLabel(text::choiceHeading(), this);
    QFont big = heading->font();
    big.setPointSizeF(big.pointSizeF() * 1.35);
    big.setBold(true);
    heading->setFont(big);
    auto *intro = new QLabel(text::choiceIntro(), this);
    intro->setWordWrap(true);

    m_models = new QListWidget(this);
    m_models->setObjectName(QStringLiteral("lstModel"));
    m_models->setSpacing(1);
    for (int id = 0; id < engine::kModelCount; ++id) {
        auto *entry = new QListWidgetItem(text::modelEntry(id), m_models);
        entry->setData(Qt::UserRole, id);
        entry->setToolTip(text::modelDetails(id));
    }
    m_models->setCurrentRow(initialModel >= 0 && initialModel < engine::kModelCount ? initialModel
                                                                                    : 0);
    m_models->setMinimumWidth(
        m_models->fontMetrics().horizontalAdvance(QStringLiteral("00   LPC - (Un-Thinned)")) + 48);

    // What tells the entries sharing a label apart, for the selected entry.
    m_description = new QLabel(this);
    m_description->setObjectName(QStringLiteral("lblModelDescription"));
    m_description->setWordWrap(true);
    m_description->setFrameShape(QFrame::StyledPanel);
    m_description->setMargin(6);
    m_description->setMinimumHeight(m_description->fontMetrics().lineSpacing() * 4 + 12);
    m_description->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    describeSelection();

    m_accept = new QPushButton(text::buttonAcceptChoice(), this);
    m_accept->setObjectName(QStringLiteral("cmdGoToMain"));
    m_accept->setDefault(true);
    m_accept->setMinimumWidth(m_accept->sizeHint().width() + 24);

    auto *choice = new QVBoxLayout;
    choice->setSpacing(8);
    choice->addWidget(heading);
    choice->addWidget(intro);
    choice->addWidget(m_models, 1);
    choice->addWidget(m_description);
    auto *buttons = new QHBoxLayout;
    buttons->addStretch(1);
    buttons->addWidget(m_accept);
    choice->addLayout(buttons);

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(14, 14, 14, 14);
    layout->setSpacing(16);
    layout->addLayout(introArea, 3);
    layout->addLayout(choice, 2);
    resize(860, 540);

    connect(m_accept, &QPushButton::clicked, this, &ModelChoiceDialog::cmdGoToMain_Click);
    connect(m_models, &QListWidget::itemActivated, this, &ModelChoiceDialog::cmdGoToMain_Click);
    connect(m_models, &QListWidget::currentRowChanged, this, &ModelChoiceDialog::describeSelection);

    startIntroduction();
}

ModelChoiceDialog::~ModelChoiceDialog() = default;

QString ModelChoiceDialog::media(const QString &name) const {
    return QDir(m_dataFolder).filePath(name);
}

void ModelChoiceDialog::startIntroduction() {
    if (QFileInfo::exists(media(text::introVideo()))) {
        m_video = new QVideoWidget(m_intro);
        m_intro->addWidget(m_video);
        m_intro->setCurrentWidget(m_video);
        m_player = new QMediaPlayer(this);
        m_player->setAudioOutput(new QAudioOutput(m_player));
        m_player->setVideoOutput(m_video);
        connect(m_player, &QMediaPlayer::mediaStatusChanged, this,
                [this](QMediaPlayer::MediaStatus status) {
                    if (status == QMediaPlayer::EndOfMedia ||
                        status == QMediaPlayer::InvalidMedia) {
                        videoFinished();
                    }
                });
        connect(m_player, &QMediaPlayer::errorOccurred, this, &ModelChoiceDialog::videoFinished);
        m_player->setSource(QUrl::fromLocalFile(media(text::introVideo())));
        m_player->play();
    } else {
        videoFinished();
    }

    if (QFileInfo::exists(media(text::introSequencePicture(1)))) {
        m_sequence->show();
        m_sequenceTimer = new QTimer(this);
        m_sequenceTimer->setInterval(kPictureInterval);
        connect(m_sequenceTimer, &QTimer::timeout, this, &ModelChoiceDialog::nextPicture);
        nextPicture();
        m_sequenceTimer->start();
    }
}

void ModelChoiceDialog::videoFinished() {
    const QString complete = media(text::introCompletePicture());
    if (QFileInfo::exists(complete)) {
        m_picture->setPicture(complete);
        m_intro->setCurrentWidget(m_picture);
    } else {
        m_intro->setCurrentWidget(m_illustration);
    }
}

void ModelChoiceDialog::nextPicture() {
    ++m_sequenceNumber;
    if (!QFileInfo::exists(media(text::introSequencePicture(m_sequenceNumber)))) {
        m_sequenceNumber = 1;
    }
    m_sequence->setPicture(media(text::introSequencePicture(m_sequenceNumber)));
}

void ModelChoiceDialog::describeSelection() {
    const int model = selectedModel();
    m_description->setText(model < 0 ? QString()
                                     : QStringLiteral("<b>%1</b><br>%2")
                                           .arg(text::modelEntry(model).toHtmlEscaped(),
                                                text::modelDetails(model).toHtmlEscaped()));
}

int ModelChoiceDialog::selectedModel() const {
    const QListWidgetItem *entry = m_models->currentItem();
    return entry != nullptr ? entry->data(Qt::UserRole).toInt() : -1;
}

QWidget *ModelChoiceDialog::introduction() const {
    return m_intro->currentWidget();
}

void ModelChoiceDialog::cmdGoToMain_Click() {
    const int model = selectedModel();
    if (model < 0) {
        return;
    }
    m_main.SetModelFromfrmModelChoice(model);
    m_main.show();
    accept();
}

void ModelChoiceDialog::done(int result) {
    if (m_sequenceTimer != nullptr) {
        m_sequenceTimer->stop();
    }
    if (m_player != nullptr) {
        m_player->stop();
    }
    QDialog::done(result);
}

} // namespace arbolex::ui
