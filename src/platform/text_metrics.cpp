// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text_metrics.h"

#include "platform/numbers.h"

namespace pelloric {

namespace {

/// Of a box whose face knows no width for it, at size 1: twips.
constexpr double BoxAdvance = 10;

} // namespace

FaceMetrics::FaceMetrics(double lineHeight)
    : advances_(std::make_unique<std::array<float, 65536>>())
    , kinds_(std::make_unique<std::array<std::uint8_t, 65536>>())
    , lineHeight_(lineHeight)
{
    advances_->fill(-1.0F);
    kinds_->fill(UnknownKind);
}

double FaceMetrics::nextAdvance(TextView text, std::size_t& position)
{
    const char16_t unit = text[position];
    if (unit < 0xD800 || unit >= 0xE000 || characterLength(text, position) == 1) {
        ++position;
        return unitAdvance(unit);
    }
    return pairOf(nextCodePoint(text, position)).advance;
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

CharacterKind FaceMetrics::learnKind(char32_t codePoint)
{
    const CharacterKind kind = askKind(codePoint);
    (*kinds_)[codePoint] = static_cast<std::uint8_t>(kind);
    return kind;
}

CharacterKind FaceMetrics::askKind(char32_t codePoint)
{
    const CharacterKind kind = characterKind(codePoint);
    const bool isDrawn = kind == CharacterKind::Plain || kind == CharacterKind::Shaped;
    return isDrawn && !hasGlyph(codePoint) ? CharacterKind::Missing : kind;
}

const FaceMetrics::Pair& FaceMetrics::pairOf(char32_t codePoint)
{
    const auto known = pairs_.find(codePoint);
    if (known != pairs_.end())
        return known->second;
    const auto advance = static_cast<float>(measureAdvance(codePoint));
    return pairs_[codePoint] = { advance < 0 ? 0.0F : advance, askKind(codePoint) };
}

double InstalledFace::measureAdvance(char32_t codePoint)
{
    if (isHalfPair(codePoint))
        return advance(ReplacementCharacter);
    switch (askKind(codePoint)) {
    case CharacterKind::Tab:
        return BlanksOfTab * advance(U' ');
    case CharacterKind::Joiner:
    case CharacterKind::LineFeed:
    case CharacterKind::Nothing:
        return 0;
    case CharacterKind::Missing: {
        const double wanted = glyphAdvance(codePoint);
        return wanted > 0 ? wanted : BoxAdvance;
    }
    default:
        return glyphAdvance(codePoint);
    }
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
