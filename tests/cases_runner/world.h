// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "case_grids.h"
#include "json.h"

#include "controls/canvas.h"
#include "controls/facade.h"
#include "platform/platform.h"
#include "platform/printer.h"
#include "platform/services.h"
#include "platform/std_files.h"
#include "platform/text_codec.h"
#include "support/build_bar.h"

#include <filesystem>
#include <memory>

namespace pelloric::cases {

/// An ASCII character is 10 twips wide at size 1, any other 20; a line is 24 twips high.
class CaseFace final : public FaceMetrics {
public:
    CaseFace()
        : FaceMetrics(24)
    {
    }

protected:
    double measureAdvance(char32_t codePoint) override { return codePoint < 0x80 ? 10 : 20; }
};

class CaseMetrics final : public TextMetrics {
public:
    FaceMetrics& face(TextView, bool, bool) override { return face_; }

private:
    CaseFace face_;
};

/// Keeps every box as [text, title, icon].
class CaseMessages final : public MessageService {
public:
    void show(const Message& message) override;

    Json shown = Json::array();
};

/// A message box as JSON.
Json jsonOf(const Message& message);

class CaseLoop final : public MessageLoop {
public:
    void runOnce() override { }
};

class CaseClock final : public Clock {
public:
    Text date() const override { return u"2004-10-23"; }
    Text time() const override { return u"12:34:56"; }
};

class CaseFolders final : public SystemFolders {
public:
    std::filesystem::path systemDirectory() const override { return directory; }

    std::filesystem::path directory;
};

/// Keeps what is called on it as [operation, value] entries.
class CasePrinter final : public Printer {
public:
    Json operations = Json::array();

    void clear() override { }
    void setFontName(TextView name) override { add("FontName", cases::jsonOf(name)); }
    void setFontSize(float size) override { add("FontSize", static_cast<double>(size)); }
    void setFontBold(bool bold) override { add("FontBold", bold); }
    void setFontItalic(bool italic) override { add("FontItalic", italic); }
    void setFontTransparent(bool transparent) override { add("FontTransparent", transparent); }
    void setForeColor(Color color) override { add("ForeColor", color); }
    void setDrawWidth(std::int16_t width) override { add("DrawWidth", width); }
    void setDrawStyle(std::int16_t style) override { add("DrawStyle", style); }
    void setFillStyle(std::int16_t style) override { add("FillStyle", style); }
    void setFillColor(Color color) override { add("FillColor", color); }
    void setCurrentX(Twips x) override { add("CurrentX", x); }
    void setCurrentY(Twips y) override { add("CurrentY", y); }
    void line(Tpoint from, Tpoint to) override
    {
        add("Line", Json::array({ from.x, from.y, to.x, to.y }));
    }
    void box(Tpoint corner, Tpoint opposite, Color outline) override
    {
        operations.push_back(Json::array(
            { "Box", Json::array({ corner.x, corner.y, opposite.x, opposite.y }), outline }));
    }
    void print(TextView text) override { add("Print", cases::jsonOf(text)); }
    void picture(TextView, Tpoint, Tpoint) override { }

    Text deviceName() const override { return u"Printer"; }
    std::int16_t paperSize() const override { return paper_; }
    std::int16_t orientation() const override { return orientation_; }
    void applyPaperSize(std::int16_t code) override
    {
        paper_ = code;
        add("paper size", code);
    }
    void applyOrientation(std::int16_t code) override
    {
        orientation_ = code;
        add("orientation", code);
    }
    void setDocumentTitle(TextView title) override;
    void newPage() override { operations.push_back(Json::array({ "NewPage" })); }
    void endDoc() override { operations.push_back(Json::array({ "EndDoc" })); }

private:
    void add(const char* operation, Json value)
    {
        operations.push_back(Json::array({ operation, std::move(value) }));
    }

    std::int16_t paper_ = 9;
    std::int16_t orientation_ = 1;
};

/// The installed printers, the current one first.
class CasePrinters final : public PrinterSystem {
public:
    std::vector<Text> names;
    bool opensThem = true;

    std::vector<Text> printerNames() const override { return names; }
    Text currentPrinter() const override { return names.empty() ? Text() : names.front(); }
    void makeCurrent(TextView) override { }
    bool opens(TextView) const override { return opensThem; }
    std::vector<PaperForm> forms() const override { return {}; }
};

class NoWindow final : public PreviewOpener {
public:
    void openPreview(std::unique_ptr<AutomationObject>) override { }
};

/// The world of one case: services, a canvas, a facade, the host's grid and a system directory.
class World {
public:
    /// @param directory  an empty folder for this case alone
    World(const std::filesystem::path& directory, TextCodec& codec);

    /// Writes a file of lines, each with CR LF behind it.
    void writeLines(const std::filesystem::path& path, const Json& lines) const;

    /// The lines of a file without CR LF.
    Json readLines(const std::filesystem::path& path) const;

    /// The settings file of this world.
    std::filesystem::path settingsFile() const;

    /// A file for documents that are saved and opened.
    std::filesystem::path documentFile() const
    {
        return directory_.parent_path() / "document.ostl";
    }

    /// Makes a grid the host's.
    void takeGrid(const Json& grid);

    CaseMetrics metrics;
    TextCodec& codec;
    CaseMessages messages;
    CaseLoop loop;
    CaseClock clock;
    CaseFolders folders;
    StdFiles files;
    CasePrinter printer;
    CasePrinters printers;
    LibraryState library;
    Platform platform;
    NoWindow window;
    Facade facade;
    Canvas canvas;
    BuildBar buildBar { canvas };
    std::unique_ptr<CaseGrid> grid;

private:
    std::filesystem::path directory_;
};

} // namespace pelloric::cases
