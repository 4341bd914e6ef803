// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/units.h"

#include <QByteArray>
#include <QIODevice>

namespace pelloric::qt {

/// Hands the bytes of a PDF file on and gives every page its exact size on the way.
///
/// The toolkit rounds the sizes of pages to whole points. Pages are therefore written on the next
/// larger whole size, and their boxes, the corner at the top left staying where it is, are cut to
/// the exact size; a box keeps its length in bytes, for the file's index counts them.
class ExactPageDevice final : public QIODevice {
public:
    /// @param target  open for writing; borrowed
    ExactPageDevice(QIODevice& target, Twips width, Twips height);

    /// The size of the pages to write on: whole points.
    static int wholePoints(Twips length);

    bool isSequential() const override { return true; }

protected:
    qint64 readData(char* data, qint64 size) override;
    qint64 writeData(const char* data, qint64 size) override;

private:
    QIODevice& target_;
    QByteArray box_; ///< what stands between the brackets of a page's box
};

} // namespace pelloric::qt
