// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "comparer/sha256.h"

#include <QByteArray>
#include <QCryptographicHash>

namespace pelloric::cases {

std::string sha256(std::string_view bytes)
{
    const auto data = QByteArray::fromRawData(bytes.data(), static_cast<qsizetype>(bytes.size()));
    return QCryptographicHash::hash(data, QCryptographicHash::Sha256).toHex().toStdString();
}

} // namespace pelloric::cases
