// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/exact_page_device.h"

#include <QByteArrayView>

namespace pelloric::qt {

namespace {

constexpr int TwipsPerPoint = 20;
constexpr QByteArrayView BoxBegin("/MediaBox [");

QByteArray points(Twips length)
{
    return QByteArray::number(static_cast<double>(length) / TwipsPerPoint, 'f', 2);
}

} // namespace

ExactPageDevice::ExactPageDevice(QIODevice& target, Twips width, Twips height)
    : target_(target)
{
    const Twips whole = wholePoints(height) * TwipsPerPoint;
    box_ = "0 " + points(whole - height) + ' ' + points(width) + ' '
        + QByteArray::number(wholePoints(height));
    open(QIODevice::WriteOnly | QIODevice::Unbuffered);
}

int ExactPageDevice::wholePoints(Twips length)
{
    return (length + TwipsPerPoint - 1) / TwipsPerPoint;
}

qint64 ExactPageDevice::readData(char*, qint64) { return -1; }

/// A page's dictionary arrives in one piece.
qint64 ExactPageDevice::writeData(const char* data, qint64 size)
{
    const QByteArrayView bytes(data, size);
    const qsizetype at = bytes.indexOf(BoxBegin);
    const qsizetype begin = at + BoxBegin.size();
    const qsizetype end = at < 0 ? -1 : bytes.indexOf(']', begin);
    if (end - begin < box_.size())
        return target_.write(data, size);
    QByteArray changed(data, size);
    changed.replace(begin, end - begin, box_.leftJustified(end - begin, ' '));
    return target_.write(changed);
}

} // namespace pelloric::qt
