// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_metrics.h"

namespace pelloric {

/// The measures of every face: an ASCII character is 10 twips wide at size 1, any other 20; a line
/// is 24 twips high.
class FakeFace : public FaceMetrics {
public:
    FakeFace()
        : FaceMetrics(24)
    {
    }

protected:
    double measureAdvance(char32_t codePoint) override { return codePoint < 0x80 ? 10 : 20; }
};

/// Knows one face, whatever its name.
class FakeMetrics : public TextMetrics {
public:
    FaceMetrics& face(TextView, bool, bool) override { return face_; }

private:
    FakeFace face_;
};

} // namespace pelloric
