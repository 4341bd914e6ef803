// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text_runs.h"

#include "platform/text_metrics.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr TextView Replacement(&ReplacementCharacter, 1);

constexpr double BoxTop = 0.86; ///< above the baseline: ems
constexpr double BoxBottom = 0.16; ///< below the baseline: ems
constexpr double BoxBearing = 0.09; ///< free on either side: ems
constexpr double MostBearing = 0.2; ///< of the advance
constexpr double BoxStroke = 0.045; ///< ems

/// Gathers neighbouring characters that are drawn together.
class RunCutter {
public:
    RunCutter(TextView text, FaceMetrics& face, std::vector<TextRun>& runs)
        : text_(text)
        , face_(face)
        , runs_(runs)
    {
    }

    void cut()
    {
        for (std::size_t position = 0; position < text_.size();) {
            const std::size_t begin = position;
            const char32_t codePoint = nextCodePoint(text_, position);
            if (isHalfPair(codePoint))
                takeAlone(Replacement, ReplacementCharacter);
            else
                take(text_.substr(begin, position - begin), codePoint);
        }
        endRun();
    }

private:
    void take(TextView character, char32_t codePoint)
    {
        const CharacterKind kind = face_.kindOf(codePoint);
        switch (kind) {
        case CharacterKind::Plain:
        case CharacterKind::Shaped:
        case CharacterKind::Joiner:
            extendRun(character, kind, face_.advance(codePoint));
            return;
        case CharacterKind::Missing:
            takeAlone(character, codePoint);
            return;
        case CharacterKind::Tab:
        case CharacterKind::Nothing:
            endRun();
            left_ += face_.advance(codePoint);
            return;
        case CharacterKind::LineFeed:
            endRun();
            ++line_;
            left_ = 0;
            return;
        }
    }

    void takeAlone(TextView character, char32_t codePoint)
    {
        endRun();
        const double advance = face_.advance(codePoint);
        const bool isMissing = face_.kindOf(codePoint) == CharacterKind::Missing;
        runs_.push_back(
            { character, line_, left_, advance, isMissing ? RunKind::Box : RunKind::Plain });
        left_ += advance;
    }

    void extendRun(TextView character, CharacterKind kind, double advance)
    {
        if (run_.text.empty())
            run_ = { TextView(character.data(), 0), line_, left_, 0, RunKind::Plain };
        run_.text = TextView(run_.text.data(), run_.text.size() + character.size());
        run_.advance += advance;
        left_ += advance;
        hasGlyphs_ = hasGlyphs_ || kind != CharacterKind::Joiner;
        if (kind != CharacterKind::Plain)
            run_.kind = RunKind::Shaped;
    }

    void endRun()
    {
        if (hasGlyphs_)
            runs_.push_back(run_);
        run_.text = {};
        hasGlyphs_ = false;
    }

    TextView text_;
    FaceMetrics& face_;
    std::vector<TextRun>& runs_;
    TextRun run_; ///< that is being gathered; no text: none
    bool hasGlyphs_ = false; ///< the run is more than joiners
    std::size_t line_ = 0;
    double left_ = 0;
};

} // namespace

void cutIntoRuns(TextView text, FaceMetrics& face, std::vector<TextRun>& runs)
{
    runs.clear();
    RunCutter(text, face, runs).cut();
}

std::size_t lineCount(TextView text)
{
    return 1 + static_cast<std::size_t>(std::ranges::count(text, u'\n'));
}

double longestLineAdvance(TextView text, FaceMetrics& face)
{
    double longest = 0;
    while (true) {
        const TextView line = text.substr(0, text.find(u'\n'));
        longest = std::max(longest, face.advanceOf(line));
        if (line.size() == text.size())
            return longest;
        text.remove_prefix(line.size() + 1);
    }
}

HollowBox hollowBox(double advance, double em)
{
    const double bearing = std::min(em * BoxBearing, advance * MostBearing);
    const double right = advance - bearing;
    const double stroke = std::min(em * BoxStroke, (right - bearing) / 3);
    return { bearing, -em * BoxTop, right, em * BoxBottom, stroke };
}

} // namespace pelloric
