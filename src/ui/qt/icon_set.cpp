// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/icon_set.h"

#include <QFile>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>
#include <QPixmap>
#include <QSvgRenderer>

#include <algorithm>

/// The pictures are part of a library that may be linked statically; the macro works outside
/// namespaces only.
static void initPictures() { Q_INIT_RESOURCE(pelloric_icons); }

namespace pelloric::qt {

namespace {

/// Draws a picture anew for every size, so that it is sharp on every screen.
class PictureEngine final : public QIconEngine {
public:
    PictureEngine(QByteArray picture, QColor enabled, QColor disabled)
        : picture_(std::move(picture))
        , enabled_(enabled)
        , disabled_(disabled)
    {
    }

    void paint(QPainter* painter, const QRect& area, QIcon::Mode mode, QIcon::State) override
    {
        const QColor color = mode == QIcon::Disabled ? disabled_ : enabled_;
        QByteArray colored = picture_;
        colored.replace("currentColor", color.name(QColor::HexRgb).toLatin1());
        QSvgRenderer renderer(colored);
        QRectF square(area);
        const qreal side = std::min(square.width(), square.height());
        square = { square.center().x() - side / 2, square.center().y() - side / 2, side, side };
        painter->setRenderHint(QPainter::Antialiasing);
        renderer.render(painter, square);
    }

    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override
    {
        QPixmap pixmap(size);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        paint(&painter, QRect(QPoint(0, 0), size), mode, state);
        return pixmap;
    }

    bool isNull() override { return picture_.isEmpty(); }

    QIconEngine* clone() const override { return new PictureEngine(picture_, enabled_, disabled_); }

private:
    QByteArray picture_;
    QColor enabled_;
    QColor disabled_;
};

} // namespace

QIcon libraryIcon(const QString& name, const QPalette& palette)
{
    initPictures();
    QFile file(QStringLiteral(":/pelloric/icons/%1.svg").arg(name));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    return QIcon(
        new PictureEngine(file.readAll(), palette.color(QPalette::Active, QPalette::ButtonText),
            palette.color(QPalette::Disabled, QPalette::ButtonText)));
}

} // namespace pelloric::qt
