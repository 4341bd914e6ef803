// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "settings/settings_file.h"
#include "ui/margin_sketch.h"
#include "ui/paper_choice.h"
#include "ui/settings_access.h"

#include <array>

namespace pelloric {

/// An entry of the popup over a header or footer box, and the text that it puts there.
struct FieldEntry {
    TextView caption;
    TextView field;
};

inline constexpr auto FieldEntries = std::to_array<FieldEntry>({
    { u"Date Printed", u"[Date Printed]" },
    { u"Time Printed", u"[Time Printed]" },
    { u"Date and Time Printed", u"[Date & Time Printed]" },
    { u"Page # of Pages #", u"[Page # of Pages #]" },
    { u"Total Pages", u"[Total Pages]" },
    { u"Page Number", u"[Page #]" },
});

/// Title and tabs of the dialog.
inline constexpr TextView PageSetupTitle = u"Page Setup";
inline constexpr TextView PageSetupTabs[] = { u"Page", u"Margins", u"Header\\Footer" };

/// Colour of the ruled table in the sketch.
inline constexpr Color SketchColor = 0xFFC0C0;

/// The page setup dialog without its widgets.
///
/// A widget hands on what its user did and shows then what stands here.
class PageSetupState {
public:
    static constexpr int FormatBoxes = 6;

    /// Loads fonts, texts, paper and margins, in this order; what cannot be read is passed over.
    /// @param platform  outlives the dialog
    /// @param own       shown and changed instead of the settings file; null: the file
    explicit PageSetupState(const Platform& platform, ReportSettings* own = nullptr);

    /// As above, with papers that are known already.
    PageSetupState(const Platform& platform, const std::vector<PaperForm>& forms,
        ReportSettings* own = nullptr);

    PaperChoice paper;
    ColoredFont headerFont;
    ColoredFont footerFont;
    /// As typed: header left, centre, right; footer left, centre, right.
    std::array<Text, FormatBoxes> formatTexts;

    const std::vector<PaperRow>& paperRows() const { return rows_; }
    /// Puts other papers into the list; what was chosen stays.
    void setForms(const std::vector<PaperForm>& forms);

    MarginSketch& sketch() { return sketch_; }
    const MarginSketch& sketch() const { return sketch_; }

    /// The text of a margin box: "12.5 mm".
    const Text& marginBox(Margin margin) const { return boxes_[static_cast<std::size_t>(margin)]; }

    /// The text of a margin box was changed by typing: digits and points stay, " mm" follows.
    void typeMargin(Margin margin, TextView text);

    /// A spin button was pressed: one millimetre more, or less while the number is above 0.
    ///
    /// What it writes is not filtered, so 0.5 steps down to "-0.5 mm".
    void stepMargin(Margin margin, bool up);

    /// All margins are 10 mm again.
    void restoreMargins();

    /// A button was released over a margin line: the box of the dragged margin follows.
    void releaseLine();

    /// Chooses the orientation and sizes the sketch in its frame.
    void chooseOrientation(bool portrait);

    /// Where the sketch stands in its frame.
    const SketchRect& picture() const { return picture_; }

    /// A header or footer box got the focus. @param box  1 to 6; anything else is ignored
    void focusFormatBox(int box);
    /// The box that had the focus last; 0 before any had it.
    int lastFormatBox() const { return lastFormatBox_; }
    /// Puts a field into the box that had the focus last, in place of all its text.
    /// @param entry  index into `FieldEntries`; anything else is ignored
    void chooseField(int entry);

    void setHeaderFont(const ColoredFont& answer) { headerFont = chosenFont(answer); }
    void setFooterFont(const ColoredFont& answer) { footerFont = chosenFont(answer); }
    Text headerFontText() const;
    Text footerFontText() const;

    /// What keeps `save` from writing anything, as it was when the dialog opened: a missing file,
    /// or keys that are missing in it; empty when all is well.
    const Text& fileHint() const { return fileHint_; }

    /// Rewrites the settings, all or nothing; the dialog closes in every case.
    ///
    /// `NothingWritten`: a step failed, a size box without "mm" or a key that the file lacks; the
    /// dialog tells nobody. `WriteFailed`: the file could not be written.
    SaveOutcome save() const;

private:
    void loadTexts(const LenientSettings& settings);
    void loadPaper(const LenientSettings& settings);
    void loadMargins(const LenientSettings& settings);
    void writeBox(Margin margin, Text text);
    void sizeSketch();

    const Platform& platform_;
    ReportSettings* own_;
    Text fileHint_;
    std::vector<PaperRow> rows_;
    MarginSketch sketch_;
    std::array<Text, 4> boxes_;
    SketchRect picture_;
    int lastFormatBox_ = 0;
};

} // namespace pelloric
