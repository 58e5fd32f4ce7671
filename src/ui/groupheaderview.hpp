#pragma once

#include <QHeaderView>

namespace arbolex::ui {

/// Horizontal header of two levels: a band naming the column groups (the
/// model's header data under `groupRole`) above the captions of the columns.
/// Neighbouring columns of the same group share one band.
class GroupHeaderView : public QHeaderView {
    Q_OBJECT
public:
    explicit GroupHeaderView(int groupRole, QWidget *parent = nullptr);

protected:
    void paintSection(QPainter *painter, const QRect &rect, int section) const override;
    QSize sectionSizeFromContents(int section) const override;

private:
    QString group(int section) const;
    /// Height of the group band, pixels.
    int bandHeight() const;

    int m_groupRole;
};

} // namespace arbolex::ui
