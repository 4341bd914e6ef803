// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QByteArray>
#include <QString>

#include <functional>

class QXmlStreamReader;

namespace pelloric::qt {

using Element = std::function<void(QXmlStreamReader& xml)>;

/// Calls back at the beginning of every element of a file.
/// @throws RunTimeError TypeMismatch: it is no XML
void forEachElement(const QByteArray& bytes, const Element& element);

/// The value of an attribute by its name without a prefix; empty: there is none.
QString attribute(const QXmlStreamReader& xml, const char* name);

} // namespace pelloric::qt
