// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_structure.h"

#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace pelloric::pdf {

class PdfContent;
class PdfFile;

/// The tree that tells readers what the parts of the pages are: tables of rows of cells.
///
/// Columns that are printed together make a table, which goes on from page to page, its titles said
/// once; page headers, page footers, lines and repeated titles are beside the matter. The texts of
/// a page of which nothing is known are one paragraph. Each page is written as it ends.
class PdfTags {
public:
    /// @param file     borrowed
    /// @param content  of the pages; borrowed
    PdfTags(PdfFile& file, PdfContent& content);

    /// Begins a page.
    /// @param object     its number in the file
    /// @param structure  borrowed until the page ends
    /// @param page       of the structure, from 0
    void beginPage(int object, const PageStructure& structure, int page);

    /// Every text of the page is announced, in its order, even one that leaves no mark.
    void beforeText();

    /// The text goes on after something else was drawn for it.
    void resumeText();

    /// Everything else that is drawn is announced, too.
    void beforeShape();

    /// Ends the page and writes its part of the tree, and what stood open.
    void endPage();

    /// The entries of the page's dictionary.
    std::string pageEntries() const;

    /// Writes the rest of the tree.
    /// @return  entries of the catalogue
    std::string finish();

private:
    /// Neighbouring texts of a page that belong together.
    struct Piece {
        std::string_view tag {}; ///< empty: beside the matter
        std::uint32_t texts = 0;
        int element = 0; ///< object number
        int parent = 0; ///< object number
        std::string contents {}; ///< numbers of its marked contents
    };

    /// An element of the tree that holds others.
    struct Branch {
        int object = 0;
        std::string children {}; ///< references
    };

    struct Table {
        Branch branch {};
        bool hasHead = false;
    };

    void planTable(const PageStructure& structure, int page);
    void planHead(std::span<const CellTexts> titles, Table& table);
    void planRow(std::span<const CellTexts> cells, std::string_view cellTag, Branch& parent);
    Table& tableOf(std::span<const CellTexts> cells);
    void advance();
    void open(Piece& piece);
    void closeMark();
    void writePiece(const Piece& piece) const;
    void writeBranch(const Branch& branch, std::string_view tag, int parent) const;

    PdfFile& file_;
    PdfContent& content_;
    int root_; ///< object number
    Branch document_;
    std::map<std::vector<std::uint32_t>, Table> tables_; ///< by their columns
    std::string parents_; ///< of marked contents, page by page: references
    int pageCount_ = 0;

    int page_ = 0; ///< object number
    std::vector<Piece> pieces_;
    std::size_t next_ = 0; ///< the piece whose texts come next
    std::uint32_t left_ = 0; ///< texts of the open piece that are still to come
    std::string marked_; ///< elements with marked content, in the order of their numbers
    int markedCount_ = 0;
    enum class Mark { None, Text, Shape } mark_ = Mark::None;
};

} // namespace pelloric::pdf
