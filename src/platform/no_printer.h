// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

namespace pelloric {

/// The current printer of a system that has none: takes every setting and refuses every document.
class NoPrinter final : public Printer {
public:
    void clear() override { }
    void setFontName(TextView) override { }
    void setFontSize(float) override { }
    void setFontBold(bool) override { }
    void setFontItalic(bool) override { }
    void setFontTransparent(bool) override { }
    void setForeColor(Color) override { }
    void setDrawWidth(std::int16_t) override { }
    void setDrawStyle(std::int16_t) override { }
    void setFillStyle(std::int16_t) override { }
    void setFillColor(Color) override { }
    void setCurrentX(Twips) override { }
    void setCurrentY(Twips) override { }
    void line(Tpoint from, Tpoint to) override;
    void box(Tpoint corner, Tpoint opposite, Color outline) override;
    void print(TextView text) override;
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override;

    Text deviceName() const override { return {}; }
    std::int16_t paperSize() const override { return paperSize_; }
    std::int16_t orientation() const override { return orientation_; }
    void applyPaperSize(std::int16_t code) override { paperSize_ = code; }
    void applyOrientation(std::int16_t code) override { orientation_ = code; }
    void setDocumentTitle(TextView) override { }
    void newPage() override;
    void endDoc() override;

private:
    std::int16_t paperSize_ = 0;
    std::int16_t orientation_ = 1;
    bool begun_ = false; ///< something was drawn since the last document
};

/// The printers of a system that has none.
class NoPrinters final : public PrinterSystem {
public:
    std::vector<Text> printerNames() const override { return {}; }
    Text currentPrinter() const override { return {}; }
    void makeCurrent(TextView) override { }
    bool opens(TextView) const override { return false; }
    std::vector<PaperForm> forms() const override { return {}; }
};

} // namespace pelloric
