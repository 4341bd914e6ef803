// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/file_names.h"

#include "platform/qt/qt_text.h"

namespace pelloric::qt {

namespace {

constexpr char16_t ByteBase = 0xDC00; ///< what stands for a byte is so much more
constexpr char16_t FirstByte = ByteBase + 0x80;
constexpr char16_t LastByte = ByteBase + 0xFF;

/// The length of the character that begins there; 0 where there is none.
qsizetype characterAt(QByteArrayView bytes)
{
    constexpr qsizetype Longest = 4;
    for (qsizetype length = 1; length <= std::min(Longest, bytes.size()); ++length) {
        if (bytes.first(length).isValidUtf8())
            return length;
    }
    return 0;
}

bool standsForByte(QStringView name, qsizetype at)
{
    const char16_t unit = name[at].unicode();
    return unit >= FirstByte && unit <= LastByte && (at == 0 || !name[at - 1].isHighSurrogate());
}

} // namespace

QString fileNameOf(QByteArrayView bytes)
{
    QString name;
    while (!bytes.isEmpty()) {
        const qsizetype length = characterAt(bytes);
        if (length == 0)
            name += QChar(ByteBase + static_cast<unsigned char>(bytes.front()));
        else
            name += QString::fromUtf8(bytes.first(length));
        bytes = bytes.sliced(std::max<qsizetype>(1, length));
    }
    return name;
}

std::filesystem::path pathOf(const QString& name)
{
#ifdef Q_OS_WIN
    return toText(name);
#else
    QByteArray bytes;
    qsizetype begin = 0;
    for (qsizetype at = 0; at < name.size(); ++at) {
        if (!standsForByte(name, at))
            continue;
        bytes += QStringView(name).sliced(begin, at - begin).toUtf8();
        bytes += static_cast<char>(name[at].unicode() - ByteBase);
        begin = at + 1;
    }
    bytes += QStringView(name).sliced(begin).toUtf8();
    return bytes.toStdString();
#endif
}

} // namespace pelloric::qt
