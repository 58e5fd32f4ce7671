#pragma once

#include <QWidget>

namespace arbolex::ui {

/// The introduction of the model choice window when its video and pictures
/// are not in the data folder: an even-aged conifer stand planted in rows on a
/// hillside, with a top-height growth curve, drawn at any size.
class IntroIllustration : public QWidget {
    Q_OBJECT
public:
    explicit IntroIllustration(QWidget *parent = nullptr);

    QSize sizeHint() const override { return {420, 440}; }

protected:
    void paintEvent(QPaintEvent *event) override;
};

} // namespace arbolex::ui
