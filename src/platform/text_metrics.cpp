// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text_metrics.h"

#include "platform/numbers.h"

namespace pelloric {

FaceMetrics::FaceMetrics(double lineHeight)
    : advances_(std::make_unique<std::array<float, 65536>>())
    , lineHeight_(lineHeight)
{
    advances_->fill(-1.0F);
}

double FaceMetrics::nextAdvance(TextView text, std::size_t& position)
{
    const char16_t unit = text[position];
    if (unit < 0xD800 || unit >= 0xE000 || characterLength(text, position) == 1) {
        ++position;
        return unitAdvance(unit);
    }
    return pairAdvance(nextCodePoint(text, position));
}

double FaceMetrics::advanceOf(TextView text)
{
    double sum = 0;
    for (std::size_t position = 0; position < text.size();)
        sum += nextAdvance(text, position);
    return sum;
}

double FaceMetrics::learnAdvance(char16_t unit)
{
    const auto advance = static_cast<float>(measureAdvance(unit));
    return (*advances_)[unit] = advance < 0 ? 0.0F : advance;
}

double FaceMetrics::pairAdvance(char32_t codePoint)
{
    const auto known = pairs_.find(codePoint);
    if (known != pairs_.end())
        return known->second;
    const auto advance = static_cast<float>(measureAdvance(codePoint));
    return pairs_[codePoint] = advance < 0 ? 0.0F : advance;
}

Twips textWidth(double advance, float size)
{
    return size > 0 ? roundToInt32(advance * static_cast<double>(size)) : 0;
}

Twips textHeight(const FaceMetrics& face, float size)
{
    return size > 0 ? roundToInt32(face.lineHeight() * static_cast<double>(size)) : 0;
}

} // namespace pelloric
