// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "font_notes.h"

#include "command_line.h"
#include "outcome.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "view/missing_glyphs.h"

namespace pelloric::app {

void requireFonts()
{
    if (!qt::QtFonts::hasAny())
        throw CommandError(
            qt::phrased(u"no font is installed, so no text can be drawn; install "
                        u"fonts-dejavu-core, and fonts-arphic-uming for Chinese texts"));
}

void tellFonts(const PageDocument& document, qt::QtPlatform& platform)
{
    // Counting asks for every face of the document, so the notes are whole behind it.
    const Text missing = missingGlyphsText(
        missingGlyphs(document, platform.record().metrics, &platform.record().loop));
    for (const qt::FontNote& font : platform.fonts().notes())
        note(qt::phrased(u"the font %1 is not installed; %2 is taken instead")
                 .arg(qt::toQString(font.asked), qt::toQString(font.taken)));
    if (!missing.empty())
        note(qt::toQString(missing));
}

} // namespace pelloric::app
