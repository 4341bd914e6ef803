// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/text_file.h"

#include "platform/file_bytes.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "tables/file_kinds.h"

#include <QByteArray>
#include <QByteArrayView>
#include <QStringDecoder>

#include <uchardet/uchardet.h>

#include <algorithm>
#include <fstream>
#include <memory>
#include <string_view>
#include <utility>
#include <vector>

namespace pelloric::qt {

namespace {

constexpr qsizetype ChunkBytes = 1 << 20;

/// More tells nothing new about the letters of a text.
constexpr std::size_t DetectedBytes = 1U << 22U;

constexpr char Utf8[] = "UTF-8";
constexpr std::string_view Utf8Mark = "\xEF\xBB\xBF";
constexpr char Gb18030[] = "GB18030";
constexpr char Western[] = "windows-1252";

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::TypeMismatch, what); }

Text named(const QByteArray& encoding) { return toText(QString::fromLatin1(encoding)); }

/// Looks for values without an end while a file is read. Only bytes are known then: in an encoding
/// that somebody names, others may end a value.
class ValueEnds {
public:
    explicit ValueEnds(const TextFileOptions& options)
        : ends_(",;|\t\r\n\"")
        , most_(options.encoding.isEmpty() ? options.mostValueBytes : std::string::npos)
    {
        ends_ += options.delimiter;
    }

    /// @param from  where the bytes stand in the file
    /// @throws RunTimeError Overflow
    void look(std::string_view bytes, std::size_t from)
    {
        const std::size_t end = bytes.find_last_of(ends_);
        if (end != std::string_view::npos)
            begin_ = from + end + 1;
        if (from + bytes.size() - begin_ > most_)
            throw RunTimeError(ErrorNumber::Overflow,
                phrase(u"the value behind byte %1 holds more than %2 bytes; leave it out, or "
                       u"shorten it",
                    { decimal(static_cast<std::int64_t>(begin_)),
                        decimal(static_cast<std::int64_t>(most_)) }));
    }

private:
    std::string ends_;
    std::size_t most_; ///< bytes of a value
    std::size_t begin_ = 0; ///< of the value that has not ended
};

std::string readAll(const std::filesystem::path& path, const TextFileOptions& options)
{
    std::error_code none;
    std::ifstream file;
    if (!std::filesystem::is_directory(path, none))
        file.open(path, std::ios::binary);
    if (!file.is_open())
        throw RunTimeError(ErrorNumber::FileNotFound, pathText(path));
    const auto measured = std::filesystem::file_size(path, none);
    const std::size_t whole = none ? 0 : static_cast<std::size_t>(measured);
    constexpr auto Chunk = static_cast<std::size_t>(ChunkBytes);
    std::string bytes;
    bytes.reserve(whole + Chunk);
    std::size_t size = 0;
    ValueEnds ends(options);
    while (file) {
        bytes.resize(size + Chunk);
        file.read(bytes.data() + size, ChunkBytes);
        const std::size_t before
            = std::exchange(size, size + static_cast<std::size_t>(file.gcount()));
        ends.look(std::string_view(bytes).substr(before, size - before), before);
        if (whole == 0 && static_cast<std::int64_t>(size) > MostPipeBytes)
            throw RunTimeError(ErrorNumber::Overflow,
                phrase(
                    u"%1 goes on after 4 GB; save it to a file and name that", { pathText(path) }));
        // A pipe has no size, and a file may grow while it is read.
        tell(options.progress, static_cast<std::int64_t>(size),
            static_cast<std::int64_t>(whole > 0 ? std::max(size, whole) : 0));
    }
    if (file.bad())
        throw RunTimeError(ErrorNumber::FileNotFound, pathText(path));
    bytes.resize(size);
    return bytes;
}

bool isUtf8(std::string_view bytes) { return QByteArrayView(bytes).isValidUtf8(); }

/// A text in another encoding; nothing that is no text of it is left unseen.
struct Decoded {
    std::string text; ///< UTF-8
    bool isWhole = true; ///< all bytes are text
};

/// @param held  the first half of a pair whose second half comes with the next piece
void append(Decoded& decoded, QString& held, QString piece)
{
    piece.prepend(held);
    held.clear();
    if (!piece.isEmpty() && piece.back().isHighSurrogate()) {
        held = piece.last(1);
        piece.chop(1);
    }
    decoded.isWhole = decoded.isWhole && piece.isValidUtf16();
    decoded.text += piece.toUtf8().toStdString();
}

Decoded decode(QByteArrayView bytes, const QByteArray& encoding)
{
    QStringDecoder decoder(encoding.constData());
    Decoded decoded;
    QString held;
    for (qsizetype at = 0; at < bytes.size() && !decoder.hasError(); at += ChunkBytes)
        append(decoded, held, decoder(bytes.sliced(at, std::min(ChunkBytes, bytes.size() - at))));
    // A character that the file's end cuts off is an error only once something follows it.
    const QString ignored = decoder(QByteArrayView("\n", 1));
    decoded.isWhole = decoded.isWhole && held.isEmpty() && !decoder.hasError();
    return decoded;
}

/// The first line with bytes that are no text; 0 when the lines tell nothing.
std::int64_t badLine(QByteArrayView bytes, const QByteArray& encoding)
{
    std::int64_t line = 1;
    for (qsizetype begin = 0; begin < bytes.size(); ++line) {
        const qsizetype feed = bytes.indexOf('\n', begin);
        const qsizetype end = feed < 0 ? bytes.size() : feed + 1;
        if (!decode(bytes.sliced(begin, end - begin), encoding).isWhole)
            return line;
        begin = end;
    }
    return 0;
}

/// @param line  where the bytes are; 0 when no line tells
[[noreturn]] void refuseBytes(std::int64_t line, TextView what)
{
    refuse(line > 0 ? atLine(line, what) : Text(what));
}

/// The bytes that every character of an encoding takes at least.
std::size_t unitOf(const QByteArray& encoding)
{
    return encoding.startsWith("UTF-16") ? 2 : encoding.startsWith("UTF-32") ? 4 : 1;
}

/// Decodes as an encoding that the caller, or a mark, says it is.
TextFile decodeAs(std::string bytes, const QByteArray& encoding, TextView whoSays)
{
    if (encoding.compare(Utf8, Qt::CaseInsensitive) == 0 && isUtf8(bytes)) {
        if (bytes.starts_with(Utf8Mark))
            bytes.erase(0, Utf8Mark.size());
        return { std::move(bytes), QString::fromLatin1(encoding) };
    }
    Decoded decoded = decode(bytes, encoding);
    const std::size_t unit = unitOf(encoding);
    if (!decoded.isWhole || bytes.size() % unit != 0)
        refuseBytes(unit > 1 ? 0 : badLine(bytes, encoding), phrase(whoSays, { named(encoding) }));
    return { std::move(decoded.text), QString::fromLatin1(encoding) };
}

QByteArray encodingOfMark(QByteArrayView start)
{
    const auto encoding = QStringConverter::encodingForData(start);
    return encoding ? QByteArray(QStringConverter::nameForEncoding(*encoding)) : QByteArray();
}

/// What the letters of a text are most likely written in; empty: they do not tell.
QByteArray detectedEncoding(std::string_view bytes)
{
    const std::unique_ptr<uchardet, decltype(&uchardet_delete)> detector(
        uchardet_new(), &uchardet_delete);
    const std::size_t size = std::min(bytes.size(), DetectedBytes);
    if (!detector || uchardet_handle_data(detector.get(), bytes.data(), size) != 0)
        return {};
    uchardet_data_end(detector.get());
    return uchardet_get_charset(detector.get());
}

/// Whether all letters outside of ASCII come in pairs, as those of Chinese texts do and those of
/// Western words hardly ever.
bool isAllPairs(QByteArrayView bytes)
{
    constexpr unsigned char FirstOfPair = 0xA1;
    constexpr unsigned char LastOfPair = 0xFE;
    std::size_t run = 0;
    for (const char character : bytes) {
        const auto byte = static_cast<unsigned char>(character);
        if (byte < 0x80 && run % 2 != 0)
            return false;
        if (byte >= 0x80 && (byte < FirstOfPair || byte > LastOfPair))
            return false;
        run = byte < 0x80 ? 0 : run + 1;
    }
    return true; // the end may cut off a pair
}

/// The encodings to try, the likeliest first. A short Chinese text is easily taken for Western.
std::vector<QByteArray> guesses(std::string_view bytes)
{
    const QByteArray detected = detectedEncoding(bytes);
    const bool isWestern = detected.isEmpty() || detected.startsWith("ISO-8859")
        || detected.startsWith("WINDOWS-125") || detected.startsWith("MAC");
    if (isWestern && isAllPairs(bytes))
        return { Gb18030 };
    return { detected, Gb18030, Western };
}

/// Decodes as the likeliest encoding. A text that reads the same in the usual Western encoding as
/// in the detected one is said to be Western.
TextFile decodeGuessed(std::string_view bytes)
{
    for (const QByteArray& encoding : guesses(bytes)) {
        if (encoding.isEmpty() || !QStringDecoder(encoding.constData()).isValid())
            continue;
        Decoded decoded = decode(bytes, encoding);
        if (!decoded.isWhole)
            continue;
        const bool isWestern
            = encoding.startsWith("ISO-8859") && decode(bytes, Western).text == decoded.text;
        return { std::move(decoded.text), QString::fromLatin1(isWestern ? Western : encoding),
            true };
    }
    // The encoding that fits longer is the likelier one.
    refuseBytes(std::max(badLine(bytes, Utf8), badLine(bytes, Gb18030)),
        phrase(u"bytes that are neither UTF-8 nor GB18030 text; name the encoding"));
}

} // namespace

Text atLine(std::int64_t line, TextView what)
{
    return phrase(u"line %1: %2", { decimal(line), what });
}

TextFile readTextFile(const std::filesystem::path& path, const TextFileOptions& options)
{
    std::string bytes = readAll(path, options);
    if (const TextView kind = notATable(bytes); !kind.empty())
        refuse(phrase(kind));
    if (!options.encoding.isEmpty()) {
        const QByteArray encoding = options.encoding.toLatin1();
        if (!QStringDecoder(encoding.constData()).isValid())
            refuse(phrase(
                u"unknown encoding %1; known are UTF-8, GB18030, GBK, Big5, UTF-16 and ISO-8859-1, "
                u"among others",
                { toText(options.encoding) }));
        return decodeAs(std::move(bytes), encoding, phraseText(u"bytes that are no %1"));
    }
    if (const QByteArray marked = encodingOfMark(std::string_view(bytes).substr(0, 4));
        !marked.isEmpty())
        return decodeAs(std::move(bytes), marked,
            phraseText(u"bytes that are no %1, which the file's mark says it is"));
    if (isUtf8(bytes))
        return { std::move(bytes), QString::fromLatin1(Utf8) };
    return decodeGuessed(bytes);
}

} // namespace pelloric::qt
