// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/hand_cursor.h"

#include <QPainter>
#include <QSvgRenderer>

#include <cmath>

namespace pelloric::qt {

namespace {

constexpr int HandSize = 24; ///< pixels

constexpr char Hand[] = R"(<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 24 24">
<path d="M7.2 13.2V5.9c0-2.2 3-2.2 3 0V4.2c0-2.3 3.1-2.3 3.1 0v1.3c0-2.2 3-2.2 3 0v2.2c0-2 2.9-2 2.9 0v7.6
c0 4-2.3 6.2-5.9 6.2-3 0-4.6-1.2-6-3.6l-3.5-5.6c-1.1-1.9 1.3-3.2 2.5-1.7z" fill="#fff" stroke="#000"
 stroke-width="1.3" stroke-linejoin="round"/>
<path d="M10.2 6v5M13.3 5v6M16.3 7.5v4" stroke="#000" stroke-width="1.1" stroke-linecap="round"/>
</svg>)";

} // namespace

QPixmap handPicture(qreal devicePixelRatio)
{
    const int pixels = static_cast<int>(std::ceil(HandSize * devicePixelRatio));
    QPixmap picture(pixels, pixels);
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    QSvgRenderer(QByteArray::fromRawData(Hand, sizeof Hand - 1)).render(&painter);
    painter.end();
    picture.setDevicePixelRatio(devicePixelRatio);
    return picture;
}

} // namespace pelloric::qt
