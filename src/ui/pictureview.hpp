#pragma once

#include <QLabel>
#include <QPixmap>

namespace arbolex::ui {

/// A picture shown as large as its room allows, keeping its proportions,
/// and scaled again whenever the room changes.
class PictureView : public QLabel {
    Q_OBJECT
public:
    explicit PictureView(QWidget *parent = nullptr);

    /// Shows the picture of `path`; nothing when it cannot be read.
    void setPicture(const QString &path);

protected:
    void resizeEvent(QResizeEvent *event) override;

private:
    void rescale();

    QPixmap m_source;
};

} // namespace arbolex::ui
