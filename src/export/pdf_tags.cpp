// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_tags.h"

#include "export/pdf_content.h"
#include "export/pdf_file.h"
#include "export/pdf_syntax.h"

#include <limits>

namespace pelloric::pdf {

namespace {

constexpr std::uint32_t AllTexts = std::numeric_limits<std::uint32_t>::max();

constexpr std::string_view Header = "<</Type/Pagination/Subtype/Header>>";
constexpr std::string_view Footer = "<</Type/Pagination/Subtype/Footer>>";
constexpr std::string_view Lines = "<</Type/Layout>>";

/// A title says what stands below it.
constexpr std::string_view ColumnScope = "/A<</O/Table/Scope/Column>>";

constexpr std::string_view TitleTag = "TH";
constexpr std::string_view CellTag = "TD";

void appendItem(std::string& list, int object)
{
    appendReference(list, object);
    list += ' ';
}

std::uint32_t textsOf(std::span<const CellTexts> cells)
{
    std::uint32_t texts = 0;
    for (const CellTexts& cell : cells)
        texts += cell.texts;
    return texts;
}

} // namespace

PdfTags::PdfTags(PdfFile& file, PdfContent& content)
    : file_(file)
    , content_(content)
    , root_(file.reserve())
    , document_ { file.reserve(), {} }
{
}

void PdfTags::beginPage(int object, const PageStructure& structure, int page)
{
    page_ = object;
    pieces_.clear();
    marked_.clear();
    markedCount_ = 0;
    next_ = 0;
    left_ = 0;
    mark_ = Mark::None;
    if (structure.isTable(page)) {
        planTable(structure, page);
    } else {
        pieces_.push_back({ "P", AllTexts, file_.reserve(), document_.object, {} });
        appendItem(document_.children, pieces_.back().element);
    }
}

void PdfTags::planTable(const PageStructure& structure, int page)
{
    const std::span<const CellTexts> titles = structure.titles(page);
    pieces_.push_back({ .texts = structure.headerTexts(page) });
    Table& table = tableOf(titles.empty() ? structure.row(page, 0) : titles);
    if (!titles.empty())
        planHead(titles, table);
    if (structure.rowCount(page) > 0) {
        Branch body { file_.reserve(), {} };
        for (std::size_t row = 0; row < structure.rowCount(page); ++row)
            planRow(structure.row(page, row), CellTag, body);
        writeBranch(body, "TBody", table.branch.object);
        appendItem(table.branch.children, body.object);
    }
    pieces_.push_back({ .texts = AllTexts });
}

/// Titles are said once; on the pages that follow they are there for the eye only.
void PdfTags::planHead(std::span<const CellTexts> titles, Table& table)
{
    if (table.hasHead) {
        pieces_.push_back({ .texts = textsOf(titles) });
        return;
    }
    table.hasHead = true;
    Branch head { file_.reserve(), {} };
    planRow(titles, TitleTag, head);
    writeBranch(head, "THead", table.branch.object);
    appendItem(table.branch.children, head.object);
}

void PdfTags::planRow(std::span<const CellTexts> cells, std::string_view cellTag, Branch& parent)
{
    Branch row { file_.reserve(), {} };
    for (const CellTexts& cell : cells) {
        pieces_.push_back({ cellTag, cell.texts, file_.reserve(), row.object, {} });
        appendItem(row.children, pieces_.back().element);
    }
    writeBranch(row, "TR", parent.object);
    appendItem(parent.children, row.object);
}

PdfTags::Table& PdfTags::tableOf(std::span<const CellTexts> cells)
{
    std::vector<std::uint32_t> fields;
    for (const CellTexts& cell : cells)
        fields.push_back(cell.field);
    const auto [table, isNew] = tables_.try_emplace(std::move(fields));
    if (isNew) {
        table->second.branch.object = file_.reserve();
        appendItem(document_.children, table->second.branch.object);
    }
    return table->second;
}

void PdfTags::beforeText()
{
    if (left_ == 0)
        advance();
    else
        resumeText();
    if (left_ != AllTexts && left_ > 0)
        --left_;
}

void PdfTags::resumeText()
{
    if (mark_ != Mark::Text && next_ > 0)
        open(pieces_[next_ - 1]);
}

/// Goes on to the next piece that has texts.
void PdfTags::advance()
{
    while (next_ < pieces_.size() && pieces_[next_].texts == 0)
        ++next_;
    if (next_ == pieces_.size())
        return;
    Piece& piece = pieces_[next_++];
    left_ = piece.texts;
    open(piece);
}

/// A piece is one marked content, or several where shapes interrupt it.
void PdfTags::open(Piece& piece)
{
    closeMark();
    mark_ = Mark::Text;
    if (piece.tag.empty()) {
        content_.beginMark("Artifact", next_ == pieces_.size() ? Footer : Header, true);
        return;
    }
    std::string properties("<</MCID ");
    appendInteger(properties, markedCount_);
    appendInteger(piece.contents, markedCount_++);
    piece.contents += ' ';
    content_.beginMark(piece.tag, properties + ">>", true);
    appendItem(marked_, piece.element);
}

void PdfTags::beforeShape()
{
    if (mark_ == Mark::Shape)
        return;
    closeMark();
    content_.beginMark("Artifact", Lines, false);
    mark_ = Mark::Shape;
}

void PdfTags::closeMark()
{
    if (mark_ != Mark::None)
        content_.endMark();
    mark_ = Mark::None;
}

void PdfTags::endPage()
{
    closeMark();
    for (const Piece& piece : pieces_) {
        if (!piece.tag.empty())
            writePiece(piece);
    }
    const int marked = file_.reserve();
    file_.write(marked, "[" + marked_ + "]");
    appendInteger(parents_, pageCount_++);
    parents_ += ' ';
    appendItem(parents_, marked);
}

std::string PdfTags::pageEntries() const
{
    std::string entries("/Tabs/S/StructParents ");
    appendInteger(entries, pageCount_ - 1);
    return entries;
}

std::string PdfTags::finish()
{
    for (const auto& [fields, table] : tables_)
        writeBranch(table.branch, "Table", document_.object);
    writeBranch(document_, "Document", root_);
    const int parents = file_.reserve();
    file_.write(parents, "<</Nums[" + parents_ + "]>>");
    std::string body("<</Type/StructTreeRoot/RoleMap<<>>/K ");
    appendReference(body, document_.object);
    body += "/ParentTree ";
    appendReference(body, parents);
    body += "/ParentTreeNextKey ";
    appendInteger(body, pageCount_);
    file_.write(root_, body + ">>");
    std::string entries("/MarkInfo<</Marked true>>/StructTreeRoot ");
    appendReference(entries, root_);
    return entries;
}

void PdfTags::writePiece(const Piece& piece) const
{
    std::string body("<</S");
    appendName(body, piece.tag);
    body += "/P ";
    appendReference(body, piece.parent);
    if (!piece.contents.empty()) {
        body += "/Pg ";
        appendReference(body, page_);
        body += "/K[" + piece.contents + ']';
    }
    if (piece.tag == TitleTag)
        body += ColumnScope;
    file_.write(piece.element, body + ">>");
}

void PdfTags::writeBranch(const Branch& branch, std::string_view tag, int parent) const
{
    std::string body("<</S");
    appendName(body, tag);
    body += "/P ";
    appendReference(body, parent);
    body += "/K[" + branch.children + ']';
    file_.write(branch.object, body + ">>");
}

} // namespace pelloric::pdf
