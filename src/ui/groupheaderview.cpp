#include "ui/groupheaderview.hpp"

#include <QPainter>
#include <QStyleOptionHeader>

namespace arbolex::ui {

GroupHeaderView::GroupHeaderView(int groupRole, QWidget *parent)
    : QHeaderView(Qt::Horizontal, parent), m_groupRole(groupRole) {
    setDefaultAlignment(Qt::AlignCenter);
    setHighlightSections(false);
}

QString GroupHeaderView::group(int section) const {
    return model() != nullptr ? model()->headerData(section, orientation(), m_groupRole).toString()
                              : QString();
}

int GroupHeaderView::bandHeight() const {
    return fontMetrics().height() + 8;
}

QSize GroupHeaderView::sectionSizeFromContents(int section) const {
    QSize size = QHeaderView::sectionSizeFromContents(section);
    // Room for the caption only: the grid is never sorted, so no space is
    // kept for a sort arrow.
    const QString caption = model() != nullptr
                                ? model()->headerData(section, orientation()).toString().trimmed()
                                : QString();
    size.setWidth(fontMetrics().horizontalAdvance(caption) + 12);
    size.setHeight(size.height() + bandHeight());
    return size;
}

void GroupHeaderView::paintSection(QPainter *painter, const QRect &rect, int section) const {
    const int band = bandHeight();
    const QRect captionRect(rect.left(), rect.top() + band, rect.width(), rect.height() - band);
    const QRect bandRect(rect.left(), rect.top(), rect.width(), band);

    painter->save();
    painter->setClipRect(captionRect);
    QHeaderView::paintSection(painter, captionRect, section);
    painter->restore();

    // The band spans every visible neighbour of the same group; each section
    // paints its own slice of it, so a partial repaint stays seamless.
    const QString name = group(section);
    QRect span = bandRect;
    if (!name.isEmpty()) {
        const int visual = visualIndex(section);
        for (int v = visual - 1; v >= 0; --v) {
            const int l = logicalIndex(v);
            if (isSectionHidden(l) || group(l) != name) {
                break;
            }
            span.setLeft(span.left() - sectionSize(l));
        }
        for (int v = visual + 1; v < count(); ++v) {
            const int l = logicalIndex(v);
            if (isSectionHidden(l) || group(l) != name) {
                break;
            }
            span.setRight(span.right() + sectionSize(l));
        }
    }

    QStyleOptionHeader opt;
    initStyleOption(&opt);
    opt.rect = span;
    opt.section = section;
    opt.text = name;
    opt.textAlignment = Qt::AlignCenter;
    opt.position = QStyleOptionHeader::Middle;
    opt.state |= QStyle::State_Raised;
    if (isEnabled()) {
        opt.state |= QStyle::State_Enabled;
    }
    painter->save();
    painter->setClipRect(bandRect);
    QFont bold = painter->font();
    bold.setBold(true);
    painter->setFont(bold);
    style()->drawControl(QStyle::CE_Header, &opt, painter, this);
    painter->restore();
}

} // namespace arbolex::ui
