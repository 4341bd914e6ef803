// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/joined_lines.h"

#include "platform/drawing_state.h"

#include <gtest/gtest.h>

#include <vector>

namespace pelloric {

namespace {

/// Notes lines with their pens, and when a text is printed.
class LineNotes final : public StatefulSurface {
public:
    std::vector<std::string> notes;

    void clear() override { }
    void line(Tpoint from, Tpoint to) override
    {
        notes.push_back(point(from) + " " + point(to) + " " + std::to_string(state_.foreColor));
    }

    void box(Tpoint, Tpoint, Color) override { notes.emplace_back("box"); }
    void print(TextView) override { notes.push_back("text " + std::to_string(state_.foreColor)); }
    void picture(TextView, Tpoint, Tpoint) override { }

private:
    static std::string point(Tpoint point)
    {
        return std::to_string(point.x) + "," + std::to_string(point.y);
    }
};

using Notes = std::vector<std::string>;

} // namespace

TEST(JoinedLines, DrawLinesThatContinueEachOtherAsOne)
{
    LineNotes notes;
    JoinedLines lines(notes);
    for (const Twips top : { 0, 100, 200 }) {
        lines.line({ 10, top }, { 10, top + 100 });
        lines.line({ 20, top + 100 }, { 20, top });
        lines.line({ 10, top }, { 20, top });
    }
    EXPECT_TRUE(notes.notes.empty());
    lines.finish();
    EXPECT_EQ(notes.notes,
        (Notes { "10,0 10,300 0", "20,0 20,300 0", "10,0 20,0 0", "10,100 20,100 0",
            "10,200 20,200 0" }));
}

TEST(JoinedLines, KeepApartWhatHasAnotherPenOrIsNoPlainLine)
{
    LineNotes notes;
    JoinedLines lines(notes);
    lines.line({ 0, 0 }, { 0, 100 });
    lines.setForeColor(255);
    lines.line({ 0, 100 }, { 0, 200 });
    lines.line({ 0, 200 }, { 50, 300 });
    lines.setDrawStyle(1);
    lines.line({ 0, 200 }, { 0, 300 });
    lines.finish();
    EXPECT_EQ(notes.notes,
        (Notes { "0,0 0,100 0", "0,100 0,200 255", "0,200 50,300 255", "0,200 0,300 255" }));
}

TEST(JoinedLines, AreDrawnBeforeWhatCoversThem)
{
    LineNotes notes;
    JoinedLines lines(notes);
    lines.line({ 0, 0 }, { 0, 100 });
    lines.box({}, {}, 0);
    lines.line({ 0, 100 }, { 0, 200 });
    lines.setForeColor(7);
    lines.print(u"text");
    EXPECT_EQ(notes.notes, (Notes { "0,0 0,100 0", "box", "0,100 0,200 0", "text 7" }));
}

} // namespace pelloric
