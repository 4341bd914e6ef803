// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_writer.h"

#include "export/pdf_hatches.h"
#include "export/pdf_metadata.h"
#include "export/pdf_outline.h"
#include "export/pdf_syntax.h"
#include "platform/units.h"

#include <utility>

namespace pelloric::pdf {

namespace {

/// Pages of a branch of the page tree.
constexpr int BranchSize = 64;

constexpr std::string_view Program = "Pelloric";

} // namespace

PdfWriter::PdfWriter(const PdfServices& services, PdfInfo info, double pixel)
    : file_(services.sink, services.deflater)
    , fonts_(file_)
    , pictures_(file_, services.pictures)
    , content_(fonts_)
    , surface_(content_, services.faces, fonts_, pictures_)
    , info_(std::move(info))
    , pixel_(pixel)
    , resources_(file_.reserve())
    , root_(file_.reserve())
{
    if (info_.isTagged)
        surface_.setTags(&tags_.emplace(file_, content_));
}

DrawingSurface& PdfWriter::beginPage(const Paper& paper, const PageStructure& structure, int page)
{
    paper_ = paper;
    page_ = file_.reserve();
    if (tags_)
        tags_->beginPage(page_, structure, page);
    content_.begin();
    surface_.setPlace({ .height = paper.height, .origin = paper.origin, .pixel = pixel_ });
    surface_.clear();
    return surface_;
}

void PdfWriter::endPage()
{
    if (branches_.empty() || branches_.back().count == BranchSize) {
        closeBranch();
        branches_.push_back({ .object = file_.reserve() });
    }
    if (tags_)
        tags_->endPage();
    Branch& branch = branches_.back();
    const int content = file_.reserve();
    file_.writeStream(content, {}, content_.end());
    std::string body("<</Type/Page/Parent ");
    appendReference(body, branch.object);
    body += "/MediaBox[0 0 ";
    appendNumbers(body, paper_.width / TwipsPerPoint, paper_.height / TwipsPerPoint);
    body += "]/Resources ";
    appendReference(body, resources_);
    body += "/Contents ";
    appendReference(body, content);
    if (tags_)
        body += tags_->pageEntries();
    file_.write(page_, body + ">>");
    appendReference(branch.pages, page_);
    branch.pages += ' ';
    ++branch.count;
    pages_.push_back(page_);
}

void PdfWriter::finish()
{
    closeBranch();
    std::string tree("<</Type/Pages/Kids[");
    for (const Branch& branch : branches_) {
        appendReference(tree, branch.object);
        tree += ' ';
    }
    tree += "]/Count ";
    appendInteger(tree, static_cast<std::int64_t>(pages_.size()));
    file_.write(root_, tree + ">>");
    fonts_.write();
    std::string shared("<<");
    if (const std::string fonts = fonts_.resources(); !fonts.empty())
        shared += "/Font<<" + fonts + ">>";
    if (!pictures_.resources().empty())
        shared += "/XObject<<" + pictures_.resources() + ">>";
    if (content_.hasHatches())
        shared += writeHatches(file_, pixel_, paper_.height);
    file_.write(resources_, shared + ">>");
    const int catalog = writeRoot();
    file_.finish({ .catalog = catalog, .info = writeInfo(), .identifier = identifier() });
}

/// Writes a branch whose pages are known and leaves only its number.
void PdfWriter::closeBranch()
{
    if (branches_.empty())
        return;
    Branch& branch = branches_.back();
    std::string body("<</Type/Pages/Parent ");
    appendReference(body, root_);
    body += "/Kids[" + branch.pages + "]/Count ";
    appendInteger(body, branch.count);
    file_.write(branch.object, body + ">>");
    branch.pages = {};
}

int PdfWriter::writeRoot()
{
    std::string body("<</Type/Catalog/Pages ");
    appendReference(body, root_);
    if (!info_.language.empty()) {
        body += "/Lang";
        appendText(body, info_.language);
    }
    if (!info_.title.empty())
        body += "/ViewerPreferences<</DisplayDocTitle true>>";
    if (tags_) {
        body += tags_->finish() + "/PageMode/UseOutlines/Outlines ";
        appendReference(body, writeOutline(file_, pages_));
    }
    if (info_.isArchive) {
        body += "/OutputIntents[";
        appendReference(body, writeOutputIntent());
        body += ']';
    }
    if (info_.isArchive || info_.isTagged) {
        body += "/Metadata ";
        appendReference(body, writeMetadata());
    }
    const int catalog = file_.reserve();
    file_.write(catalog, body + ">>");
    return catalog;
}

/// What the colours of the pages mean.
int PdfWriter::writeOutputIntent()
{
    const int profile = file_.reserve();
    file_.writeStream(profile, "/N 3", info_.colorProfile);
    std::string body("<</Type/OutputIntent/S/GTS_PDFA1/OutputConditionIdentifier(sRGB)"
                     "/Info(sRGB)/DestOutputProfile ");
    appendReference(body, profile);
    const int intent = file_.reserve();
    file_.write(intent, body + ">>");
    return intent;
}

/// Left as it is, so that programs that know nothing of PDF find it.
int PdfWriter::writeMetadata()
{
    const int metadata = file_.reserve();
    file_.writePlainStream(metadata, "/Type/Metadata/Subtype/XML",
        metadataOf({ .title = info_.title,
            .program = Text(Program.begin(), Program.end()),
            .language = info_.language,
            .created = info_.created,
            .isArchive = info_.isArchive }));
    return metadata;
}

int PdfWriter::writeInfo()
{
    std::string body("<<");
    if (!info_.title.empty()) {
        body += "/Title";
        appendText(body, info_.title);
    }
    body.append("/Creator(").append(Program).append(")/Producer(").append(Program).append(")");
    if (!info_.created.empty())
        body.append("/CreationDate(D:").append(info_.created).append(")");
    const int info = file_.reserve();
    file_.write(info, body + ">>");
    return info;
}

/// Sixteen bytes that depend on what the file says and how long it is.
std::string PdfWriter::identifier() const
{
    std::string seed = toUtf8(info_.title) + info_.created + std::to_string(file_.size());
    std::string bytes;
    std::uint64_t hash = 14695981039346656037U;
    while (bytes.size() < 16) {
        for (const char character : seed)
            hash = (hash ^ static_cast<unsigned char>(character)) * 1099511628211U;
        for (int byte = 0; byte < 8; ++byte)
            bytes += static_cast<char>(hash >> (8U * static_cast<unsigned>(byte)));
        seed = bytes;
    }
    return bytes;
}

} // namespace pelloric::pdf
