// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/font_files.h"

#include <fontconfig/fontconfig.h>

#include <memory>

namespace pelloric::qt {

namespace {

struct FreePattern {
    void operator()(FcPattern* pattern) const { FcPatternDestroy(pattern); }
};
struct FreeObjects {
    void operator()(FcObjectSet* objects) const { FcObjectSetDestroy(objects); }
};
struct FreeFonts {
    void operator()(FcFontSet* fonts) const { FcFontSetDestroy(fonts); }
};

constexpr unsigned FontBits = 0xFFFF; ///< of an index; those above name a shape of a variable font

} // namespace

std::vector<FontFile> fontFilesOf(const QString& family)
{
    const QByteArray name = family.toUtf8();
    const std::unique_ptr<FcPattern, FreePattern> wanted(FcPatternCreate());
    FcPatternAddString(wanted.get(), FC_FAMILY, reinterpret_cast<const FcChar8*>(name.constData()));
    const std::unique_ptr<FcObjectSet, FreeObjects> told(
        FcObjectSetBuild(FC_FILE, FC_INDEX, nullptr));
    const std::unique_ptr<FcFontSet, FreeFonts> fonts(
        FcFontList(nullptr, wanted.get(), told.get()));
    std::vector<FontFile> files;
    for (int at = 0; fonts && at < fonts->nfont; ++at) {
        FcChar8* path = nullptr;
        int index = 0;
        if (FcPatternGetString(fonts->fonts[at], FC_FILE, 0, &path) != FcResultMatch
            || FcPatternGetInteger(fonts->fonts[at], FC_INDEX, 0, &index) != FcResultMatch)
            continue;
        files.push_back(
            { reinterpret_cast<const char*>(path), static_cast<unsigned>(index) & FontBits });
    }
    return files;
}

} // namespace pelloric::qt
