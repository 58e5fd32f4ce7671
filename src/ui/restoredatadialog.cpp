#include "ui/restoredatadialog.hpp"

#include "shell/datahistory.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QDialogButtonBox>
#include <QHeaderView>
#include <QLabel>
#include <QLocale>
#include <QMessageBox>
#include <QPushButton>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <utility>

namespace arbolex::ui {

namespace {
constexpr int kPathRole = Qt::UserRole;
constexpr int kIndexRole = Qt::UserRole + 1;
} // namespace

RestoreDataDialog::RestoreDataDialog(const shell::DataHistory &history, QString dataFolder,
                                     workflow::MainWindowLogic &logic, QWidget *parent)
    : QDialog(parent), m_history(history), m_dataFolder(std::move(dataFolder)), m_logic(logic) {
    setObjectName(QStringLiteral("frmRestoreData"));
    setWindowTitle(text::restoreDataTitle());

    auto *intro = new QLabel(text::restoreDataIntro(m_history.folder()), this);
    intro->setWordWrap(true);
    intro->setTextInteractionFlags(Qt::TextSelectableByMouse);

    m_copies = new QTreeWidget(this);
    m_copies->setObjectName(QStringLiteral("lstKeptCopies"));
    m_copies->setRootIsDecorated(false);
    m_copies->setAlternatingRowColors(true);
    m_copies->setHeaderLabels(text::restoreDataColumns());
    m_copies->header()->setStretchLastSection(false);
    m_copies->header()->setSectionResizeMode(QHeaderView::ResizeToContents);
    m_copies->header()->setSectionResizeMode(1, QHeaderView::Stretch);

    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    m_restore = buttons->addButton(text::restoreDataButton(), QDialogButtonBox::ActionRole);
    m_restore->setObjectName(QStringLiteral("cmdRestore"));

    auto *layout = new QVBoxLayout(this);
    layout->addWidget(intro);
    layout->addWidget(m_copies, 1);
    layout->addWidget(buttons);
    resize(620, 420);

    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(m_restore, &QPushButton::clicked, this, &RestoreDataDialog::restoreSelected);
    connect(m_copies, &QTreeWidget::itemActivated, this, &RestoreDataDialog::restoreSelected);
    connect(m_copies, &QTreeWidget::currentItemChanged, this,
            [this] { m_restore->setEnabled(m_copies->currentItem() != nullptr); });
    listCopies();
}

void RestoreDataDialog::listCopies() {
    m_copies->clear();
    const QList<shell::KeptCopy> copies = m_history.copies();
    const QLocale locale;
    for (qsizetype i = 0; i < copies.size(); ++i) {
        const shell::KeptCopy &copy = copies[i];
        auto *row = new QTreeWidgetItem(
            m_copies, {copy.fileName, locale.toString(copy.keptAt, QLocale::ShortFormat),
                       locale.formattedDataSize(copy.size)});
        row->setData(0, kPathRole, copy.path);
        row->setData(0, kIndexRole, static_cast<int>(i));
        row->setTextAlignment(2, Qt::AlignRight | Qt::AlignVCenter);
    }
    if (copies.isEmpty()) {
        auto *none = new QTreeWidgetItem(m_copies, {text::restoreDataNone()});
        none->setFlags(Qt::NoItemFlags);
    } else {
        m_copies->setCurrentItem(m_copies->topLevelItem(0));
    }
    m_restore->setEnabled(!copies.isEmpty());
}

void RestoreDataDialog::restoreSelected() {
    const QTreeWidgetItem *row = m_copies->currentItem();
    if (row == nullptr || !row->data(0, kIndexRole).isValid()) {
        return;
    }
    const QList<shell::KeptCopy> copies = m_history.copies();
    const QString path = row->data(0, kPathRole).toString();
    const auto copy = std::find_if(copies.begin(), copies.end(),
                                   [&](const shell::KeptCopy &c) { return c.path == path; });
    if (copy == copies.end()) {
        listCopies();
        return;
    }
    const QString when = QLocale().toString(copy->keptAt, QLocale::ShortFormat);
    if (QMessageBox::question(this, text::restoreDataTitle(),
                              text::restoreDataConfirm(copy->fileName, when)) != QMessageBox::Yes) {
        return;
    }
    QString error;
    if (!m_history.restore(*copy, m_dataFolder, error)) {
        QMessageBox::warning(this, text::restoreDataTitle(),
                             text::restoreDataFault(copy->fileName, error));
        return;
    }
    m_logic.reloadDataFiles();
    listCopies();
    QMessageBox::information(this, text::restoreDataTitle(),
                             text::restoreDataDone(copy->fileName, when));
}

} // namespace arbolex::ui
