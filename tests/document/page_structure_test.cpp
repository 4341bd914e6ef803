// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_structure.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

using Cells = std::vector<CellTexts>;

Cells cellsOf(std::span<const CellTexts> cells) { return { cells.begin(), cells.end() }; }

/// A cell of so many texts.
void addCell(PageStructure& structure, int page, int field, int texts)
{
    structure.beginCell(field);
    for (int text = 0; text < texts; ++text)
        structure.addText(page);
}

} // namespace

TEST(PageStructure, TellsHeaderTitlesRowsAndFooterApart)
{
    PageStructure structure;
    structure.addText(0);
    structure.addText(0);
    addCell(structure, 0, 3, 2);
    addCell(structure, 0, 5, 1);
    structure.endTitles(0);
    addCell(structure, 0, 3, 0);
    addCell(structure, 0, 5, 4);
    structure.endRow(0);
    structure.addText(0);
    EXPECT_TRUE(structure.isTable(0));
    EXPECT_EQ(structure.headerTexts(0), 2U);
    EXPECT_EQ(cellsOf(structure.titles(0)), (Cells { { 3, 2 }, { 5, 1 } }));
    ASSERT_EQ(structure.rowCount(0), 1U);
    EXPECT_EQ(cellsOf(structure.row(0, 0)), (Cells { { 3, 0 }, { 5, 4 } }));
}

TEST(PageStructure, KeepsThePagesApart)
{
    PageStructure structure;
    for (const int page : { 0, 1, 2 }) {
        for (int row = 0; row <= page; ++row) {
            addCell(structure, page, 0, page + row);
            structure.endRow(page);
        }
    }
    for (const int page : { 0, 1, 2 }) {
        ASSERT_EQ(structure.rowCount(page), static_cast<std::size_t>(page) + 1);
        for (int row = 0; row <= page; ++row)
            EXPECT_EQ(structure.row(page, static_cast<std::size_t>(row))[0].texts,
                static_cast<std::uint32_t>(page + row));
    }
}

TEST(PageStructure, KnowsNothingOfOtherPages)
{
    PageStructure structure;
    structure.addText(1);
    for (const int page : { -1, 0, 1, 2 }) {
        EXPECT_FALSE(structure.isTable(page));
        EXPECT_EQ(structure.rowCount(page), 0U);
        EXPECT_TRUE(structure.titles(page).empty());
    }
    addCell(structure, 1, 0, 1);
    structure.endRow(1);
    structure.clear();
    EXPECT_FALSE(structure.isTable(1));
}

TEST(PageStructure, TakesFourBytesForARowLikeOthers)
{
    PageStructure structure;
    for (int row = 0; row < 100'000; ++row) {
        for (int field = 0; field < 8; ++field)
            addCell(structure, row / 50, field, row % 10 == 0 ? 2 : 1);
        structure.endRow(row / 50);
    }
    EXPECT_LT(structure.memoryBytes(), 700'000U);
}

} // namespace pelloric
