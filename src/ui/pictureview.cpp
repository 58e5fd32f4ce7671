#include "ui/pictureview.hpp"

namespace arbolex::ui {

PictureView::PictureView(QWidget *parent) : QLabel(parent) {
    setAlignment(Qt::AlignCenter);
    // The room decides the size, never the picture: no layout grows to fit it.
    setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Ignored);
    setMinimumSize(1, 1);
}

void PictureView::setPicture(const QString &path) {
    m_source = QPixmap(path);
    rescale();
}

void PictureView::resizeEvent(QResizeEvent *event) {
    QLabel::resizeEvent(event);
    rescale();
}

void PictureView::rescale() {
    if (m_source.isNull()) {
        clear();
        return;
    }
    setPixmap(
        m_source.scaled(contentsRect().size(), Qt::KeepAspectRatio, Qt::SmoothTransformation));
}

} // namespace arbolex::ui
