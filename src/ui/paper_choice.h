// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

#include <cstdint>
#include <vector>

namespace pelloric {

/// A row of the list of papers.
struct PaperRow {
    Text name;
    Text cx; ///< width: "210.00 mm"
    Text cy; ///< height: "297.00 mm"
    Text value; ///< the form's place in the list, from 1
    bool isEnvelope = false; ///< shown with the envelope picture instead of the sheet

    bool operator==(const PaperRow&) const = default;
};

/// The rows of a printer's forms, in their order.
std::vector<PaperRow> paperRows(const std::vector<PaperForm>& forms);

/// Columns of the list of papers.
inline constexpr TextView PaperColumns[] = { u"name", u"cx", u"cy", u"value" };

/// The paper group of the page setup dialog: name, code, orientation and the two size boxes.
struct PaperChoice {
    Text paperName {};
    std::int16_t paperCode = 0; ///< 1-based place in the list of forms
    std::int16_t orientation = 1; ///< 1 portrait, 2 landscape
    Text widthBox {}; ///< the number, then "mm"
    Text heightBox {}; ///< the number, then "mm"
    Text caption { u"PagerSize" }; ///< what the label over the boxes says

    bool isPortrait() const { return orientation == 1; }

    /// A row was clicked; in landscape width and height go into each other's box.
    void chooseRow(const PaperRow& row);

    /// An orientation was chosen: the size texts are exchanged when they stand in the wrong order.
    ///
    /// They are compared as texts, not as numbers, on purpose: "1000mm" is less than "297mm".
    void chooseOrientation(bool portrait);
};

} // namespace pelloric
