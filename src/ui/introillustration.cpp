#include "ui/introillustration.hpp"

#include "ui/windowtexts.hpp"

#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>

#include <cmath>

namespace arbolex::ui {

namespace {

/// Height of the hillside at `x` (0 left … 1 right), as a fraction of the
/// picture's height: the slope rises to the right.
double hillAt(double x) {
    return 0.66 - 0.16 * x - 0.03 * std::sin(x * 5.0);
}

/// One conifer standing at `foot`, `size` pixels tall.
void drawConifer(QPainter &p, QPointF foot, double size, const QColor &crown) {
    const double trunkWidth = size * 0.07;
    p.setPen(Qt::NoPen);
    p.setBrush(QColor(0x6b, 0x4a, 0x2f));
    p.drawRect(QRectF(foot.x() - trunkWidth / 2, foot.y() - size * 0.18, trunkWidth, size * 0.18));
    // Three whorls of foliage, narrowing to the leader.
    const double tiers[3][3] = {{0.12, 0.60, 0.36}, {0.36, 0.82, 0.28}, {0.58, 1.0, 0.19}};
    for (const auto &t : tiers) {
        const double base = foot.y() - size * t[0];
        const double top = foot.y() - size * t[1];
        const double half = size * t[2];
        QPainterPath whorl;
        whorl.moveTo(foot.x(), top);
        whorl.lineTo(foot.x() + half, base);
        whorl.lineTo(foot.x() - half, base);
        whorl.closeSubpath();
        p.setBrush(crown);
        p.drawPath(whorl);
        // The sunlit side of the crown.
        QPainterPath lit;
        lit.moveTo(foot.x(), top);
        lit.lineTo(foot.x() - half, base);
        lit.lineTo(foot.x() - half * 0.25, base);
        lit.closeSubpath();
        p.setBrush(crown.lighter(125));
        p.drawPath(lit);
    }
}

/// Top height over age of a fast-growing spruce crop, m (a Chapman-Richards curve).
double topHeightAt(double age) {
    return 34.0 * std::pow(1.0 - std::exp(-0.045 * age), 1.6);
}

void drawGrowthCurve(QPainter &p, const QRectF &box) {
    p.setPen(QPen(QColor(0x5a, 0x6b, 0x55), 1));
    p.setBrush(QColor(255, 255, 255, 215));
    p.drawRoundedRect(box, 6, 6);

    const QFontMetricsF fm(p.font());
    const QRectF plot = box.adjusted(fm.height() + 10, 10, -12, -(fm.height() + 10));
    p.setPen(QPen(QColor(0x44, 0x44, 0x44), 1));
    p.drawLine(plot.bottomLeft(), plot.topLeft());
    p.drawLine(plot.bottomLeft(), plot.bottomRight());

    // Faint grid at every 10 years.
    p.setPen(QPen(QColor(0xcc, 0xcc, 0xcc), 1, Qt::DotLine));
    constexpr double kMaxAge = 60.0;
    constexpr double kMaxHeight = 35.0;
    for (int age = 10; age <= 60; age += 10) {
        const double x = plot.left() + plot.width() * age / kMaxAge;
        p.drawLine(QPointF(x, plot.top()), QPointF(x, plot.bottom()));
    }

    QPainterPath curve;
    for (int i = 0; i <= 60; ++i) {
        const QPointF pt(plot.left() + plot.width() * i / kMaxAge,
                         plot.bottom() - plot.height() * topHeightAt(i) / kMaxHeight);
        if (i == 0) {
            curve.moveTo(pt);
        } else {
            curve.lineTo(pt);
        }
    }
    p.setPen(QPen(QColor(0x1f, 0x6f, 0x3a), 2.5));
    p.setBrush(Qt::NoBrush);
    p.drawPath(curve);
    // The projected rows: one mark every five years from age 15.
    p.setBrush(QColor(0x1f, 0x6f, 0x3a));
    p.setPen(Qt::NoPen);
    for (int age = 15; age <= 50; age += 5) {
        p.drawEllipse(QPointF(plot.left() + plot.width() * age / kMaxAge,
                              plot.bottom() - plot.height() * topHeightAt(age) / kMaxHeight),
                      3, 3);
    }

    p.setPen(QColor(0x33, 0x33, 0x33));
    p.drawText(QRectF(plot.left(), plot.bottom() + 2, plot.width(), fm.height() + 6),
               Qt::AlignCenter, text::illustrationAxisAge());
    p.save();
    p.translate(box.left() + 4, plot.center().y());
    p.rotate(-90);
    p.drawText(QRectF(-plot.height() / 2, 0, plot.height(), fm.height() + 4), Qt::AlignCenter,
               text::illustrationAxisHeight());
    p.restore();
}

} // namespace

IntroIllustration::IntroIllustration(QWidget *parent) : QWidget(parent) {
    setObjectName(QStringLiteral("introIllustration"));
    setMinimumSize(320, 320);
}

void IntroIllustration::paintEvent(QPaintEvent * /*event*/) {
    QPainter p(this);
    p.setRenderHint(QPainter::Antialiasing);
    const double w = width();
    const double h = height();

    QLinearGradient sky(0, 0, 0, h * 0.6);
    sky.setColorAt(0.0, QColor(0x9c, 0xc7, 0xe8));
    sky.setColorAt(1.0, QColor(0xe8, 0xf1, 0xf4));
    p.fillRect(rect(), sky);

    // Distant ridge.
    QPainterPath ridge;
    ridge.moveTo(0, h * 0.50);
    for (int i = 0; i <= 40; ++i) {
        const double x = i / 40.0;
        ridge.lineTo(w * x, h * (0.42 + 0.05 * std::sin(x * 7.0 + 1.0) - 0.04 * x));
    }
    ridge.lineTo(w, h);
    ridge.lineTo(0, h);
    ridge.closeSubpath();
    p.setPen(Qt::NoPen);
    p.setBrush(QColor(0x9d, 0xb5, 0xa8));
    p.drawPath(ridge);

    // The hillside of the plantation.
    QPainterPath hill;
    hill.moveTo(0, h * hillAt(0));
    for (int i = 1; i <= 40; ++i) {
        hill.lineTo(w * i / 40.0, h * hillAt(i / 40.0));
    }
    hill.lineTo(w, h);
    hill.lineTo(0, h);
    hill.closeSubpath();
    QLinearGradient ground(0, h * 0.5, 0, h);
    ground.setColorAt(0.0, QColor(0x8c, 0xa8, 0x5c));
    ground.setColorAt(1.0, QColor(0x5f, 0x7d, 0x3a));
    p.setBrush(ground);
    p.drawPath(hill);

    // Rows of trees of one age: every tree of a row the same size, the rows
    // larger as they come nearer.
    constexpr int kRows = 5;
    for (int r = 0; r < kRows; ++r) {
        const double depth = static_cast<double>(r) / (kRows - 1);
        const double size = h * (0.10 + 0.11 * depth);
        const double spacing = size * 0.78;
        const double drop = h * (0.02 + 0.065 * r);
        const QColor crown = QColor(0x1e, 0x4d, 0x2b).lighter(static_cast<int>(135 - 35 * depth));
        const double offset = (r % 2) * spacing / 2;
        for (double x = -spacing + offset; x < w + spacing; x += spacing) {
            drawConifer(p, QPointF(x, h * hillAt(x / w) + drop), size, crown);
        }
    }

    QFont small = font();
    p.setFont(small);
    drawGrowthCurve(p, QRectF(w * 0.05, h * 0.04, w * 0.50, h * 0.30));

    // Title band.
    const QFontMetricsF fm(font());
    const double band = fm.height() * 3.4;
    p.fillRect(QRectF(0, h - band, w, band), QColor(0x10, 0x2a, 0x1a, 200));
    QFont title = font();
    title.setPointSizeF(title.pointSizeF() * 1.7);
    title.setBold(true);
    title.setLetterSpacing(QFont::PercentageSpacing, 112);
    p.setFont(title);
    p.setPen(Qt::white);
    p.drawText(QRectF(0, h - band, w, band * 0.6), Qt::AlignHCenter | Qt::AlignBottom,
               text::illustrationTitle());
    p.setFont(font());
    p.setPen(QColor(0xdd, 0xe8, 0xd8));
    p.drawText(QRectF(8, h - band * 0.4, w - 16, band * 0.4), Qt::AlignHCenter | Qt::AlignTop,
               text::illustrationSubtitle());
}

} // namespace arbolex::ui
