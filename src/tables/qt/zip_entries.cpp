// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/zip_entries.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <zip.h>

namespace pelloric::qt {

namespace {

/// Keeps a small file from unpacking to more than memory holds.
constexpr zip_uint64_t LargestEntry = 1ULL << 31U;

[[noreturn]] void refuse()
{
    throw RunTimeError(ErrorNumber::TypeMismatch,
        phrase(u"the office file is damaged; open it in its program and save it again, or save it "
               u"as CSV"));
}

struct CloseEntry {
    void operator()(zip_file* file) const { zip_fclose(file); }
};

} // namespace

void ZipEntries::Discard::operator()(zip* archive) const { zip_discard(archive); }

ZipEntries::ZipEntries(const std::filesystem::path& path)
{
    int error = 0;
    const std::u8string name = path.u8string();
    archive_.reset(zip_open(reinterpret_cast<const char*>(name.c_str()), ZIP_RDONLY, &error));
    if (!archive_)
        refuse();
}

bool ZipEntries::has(const QByteArray& name) const
{
    return zip_name_locate(archive_.get(), name.constData(), 0) >= 0;
}

QByteArray ZipEntries::read(const QByteArray& name) const
{
    zip_stat_t facts;
    zip_stat_init(&facts);
    if (zip_stat(archive_.get(), name.constData(), 0, &facts) != 0)
        return {};
    if (facts.size >= LargestEntry)
        throw RunTimeError(ErrorNumber::Overflow, phrase(u"the office file holds more than 2 GB"));
    const std::unique_ptr<zip_file, CloseEntry> file(
        zip_fopen(archive_.get(), name.constData(), 0));
    QByteArray bytes(static_cast<qsizetype>(facts.size), Qt::Uninitialized);
    if (!file
        || zip_fread(file.get(), bytes.data(), facts.size) != static_cast<zip_int64_t>(facts.size))
        refuse();
    return bytes;
}

} // namespace pelloric::qt
