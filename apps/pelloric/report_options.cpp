// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report_options.h"

#include "lengths.h"
#include "outcome.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"
#include "print/paper_names.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"

#include <QRegularExpression>

#include <array>
#include <cmath>
#include <optional>
#include <utility>
#include <vector>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "title", "TEXT", "title of the file, and centred above every page" },
    { "header-left", "TEXT", "header texts; they may hold one of the fields" },
    { "header-center", "TEXT", "[Date Printed], [Time Printed], [Date & Time Printed]," },
    { "header-right", "TEXT", "[Page # of Pages #], [Total Pages] and [Page #]" },
    { "footer-left", "TEXT", "footer texts, likewise" },
    { "footer-center", "TEXT", "" },
    { "footer-right", "TEXT", "" },
    { "paper", "NAME", "A2 to A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in" },
    { "margins", "LENGTHS", "top,right,bottom,left, or one for all: 10mm, 1.5cm or 0.5in" },
    { "landscape", nullptr, "the paper's long side lies below" },
    { "portrait", nullptr, "the paper stands upright" },
    { "merge", nullptr, "print equal neighbouring cells once" },
    { "no-headers", nullptr, "leave out the row of column titles" },
    { "font", "NAME", "the face of all texts" },
    { "font-size", "N", "the size of the cells' texts: points" },
    { "widths", "N,N,...", "widths of the columns: twips (1440 an inch); 0 leaves one out" },
});

/// An option whose value is a setting as it stands.
struct TextOption {
    const char* option;
    TextView key;
};

/// The last of the file comes first, so that no value is taken for the line of a later key.
constexpr auto TextOptions = std::to_array<TextOption>({
    { "footer-right", u"FooterRight" },
    { "footer-center", u"FooterCenter" },
    { "footer-left", u"FooterLeft" },
    { "header-right", u"HeaderRight" },
    { "header-center", u"HeaderCenter" },
    { "header-left", u"HeaderLeft" },
});

constexpr TextView FontNameKeys[] = { u"FontName", u"HeaderFontName", u"FooterFontName" };

struct Paper {
    const char* name;
    double widthMm;
    double heightMm;
};

constexpr auto Papers = std::to_array<Paper>({
    { "A2", 420, 594 },
    { "A3", 297, 420 },
    { "A4", 210, 297 },
    { "A5", 148, 210 },
    { "A6", 105, 148 },
    { "B5", 182, 257 },
    { "Letter", 215.9, 279.4 },
    { "Legal", 215.9, 355.6 },
    { "Tabloid", 279.4, 431.8 },
    { "8k", 270, 390 },
    { "16k", 197, 273 },
});

constexpr double LeastPaperMm = 30;
constexpr double MostPaperMm = 2000;

constexpr double LeastFontSize = 1;
constexpr double MostFontSize = 200;

constexpr double TitleFactor = 1.5; ///< of a title's size to that of the cells

QString paperNames()
{
    QStringList names;
    for (const Paper& paper : Papers)
        names.append(QString::fromLatin1(paper.name));
    return names.join(QStringLiteral(", "));
}

struct PaperChoice {
    QString name;
    double widthMm = 0;
    double heightMm = 0;
};

PaperChoice paperOf(const QString& text)
{
    for (const Paper& paper : Papers) {
        const QString name = QString::fromLatin1(paper.name);
        if (name.compare(text, Qt::CaseInsensitive) == 0)
            return { name, paper.widthMm, paper.heightMm };
    }
    const std::optional<SizeMm> size = sizeOf(text);
    if (!size)
        throw CommandError(QStringLiteral("unknown paper \"%1\"; take one of %2, or a size such as "
                                          "100x150mm or 4x6in")
                               .arg(text, paperNames()),
            WrongUsage);
    const auto held = [&text](double mm) {
        if (mm < LeastPaperMm || mm > MostPaperMm)
            throw CommandError(QStringLiteral("--paper takes lengths from %1 to %2 mm, not \"%3\"")
                                   .arg(LeastPaperMm)
                                   .arg(MostPaperMm)
                                   .arg(text),
                WrongUsage);
        return mm;
    };
    return { text, held(size->width), held(size->height) };
}

/// The place of a paper in the list of forms, from 1; 0, which is no form, for any other size.
std::size_t formNumber(const PaperChoice& paper)
{
    const auto forms = standardPaperForms();
    const auto isNear = [](double one, double other) { return std::abs(one - other) < 0.5; };
    for (std::size_t at = 0; at < forms.size(); ++at) {
        if (isNear(forms[at].widthMm, paper.widthMm) && isNear(forms[at].heightMm, paper.heightMm))
            return at + 1;
    }
    return 0;
}

/// Settings to be written over the user's, in order.
class Changes {
public:
    explicit Changes(const Platform& platform)
        : present_(platform)
    {
    }

    Text present(TextView key) const { return present_.value(key); }

    void add(TextView key, const QString& value)
    {
        QString line = value;
        line.replace(QRegularExpression(QStringLiteral("[\\r\\n]+")), QStringLiteral(" "));
        add(key, qt::toText(line));
    }

    void add(TextView key, Text value) { changes_.emplace_back(key, std::move(value)); }

    void write(const Platform& platform) const
    {
        std::vector<SettingChange> changes;
        for (const auto& [key, value] : changes_)
            changes.push_back({ key, value });
        const SaveOutcome outcome = batchWrite(platform, changes, FailurePolicy::StopAtFirst);
        if (outcome == SaveOutcome::NothingWritten)
            throw CommandError(QStringLiteral("the settings file lacks a key; restore it with "
                                              "\"pelloric settings --reset\""));
        if (outcome == SaveOutcome::WriteFailed)
            throw RunTimeError(ErrorNumber::WriteFailed, pathText(settingsPath(platform)));
    }

private:
    SettingsSnapshot present_;
    std::vector<std::pair<TextView, Text>> changes_;
};

void changePaper(const CommandLine& line, Changes& changes)
{
    if (!line.has("paper") && !line.has("landscape") && !line.has("portrait"))
        return;
    if (line.has("landscape") && line.has("portrait"))
        throw CommandError(
            QStringLiteral("take either --landscape or --portrait, not both"), WrongUsage);
    double width = leadingNumber(changes.present(u"PagerWidth"));
    double height = leadingNumber(changes.present(u"PagerHeight"));
    bool isLandscape = line.has("landscape");
    if (line.has("paper")) {
        const PaperChoice paper = paperOf(line.value("paper"));
        width = paper.widthMm;
        height = paper.heightMm;
        changes.add(u"PagerSize", paper.name);
        changes.add(u"PagerSizeValue", QString::number(formNumber(paper)));
        isLandscape = isLandscape || (width > height && !line.has("portrait"));
    }
    if (isLandscape == (width < height))
        std::swap(width, height);
    changes.add(u"PagerWidth", formatNumber(width));
    changes.add(u"PagerHeight", formatNumber(height));
    changes.add(u"PagerOrientation", QString::number(isLandscape ? 2 : 1));
}

/// The keys of the margins, in the order of the option.
constexpr TextView MarginKeys[] = { u"Top", u"Right", u"Buttom", u"Left" };

/// A margin of nothing would be taken for the usual one.
constexpr double LeastMarginMm = 1;

void changeMargins(const CommandLine& line, Changes& changes)
{
    if (!line.has("margins"))
        return;
    const QStringList parts = line.value("margins").split(QLatin1Char(','));
    for (std::size_t margin = 0; margin < std::size(MarginKeys); ++margin) {
        const bool isOne = parts.size() == 1;
        const auto at = isOne ? 0 : static_cast<qsizetype>(margin);
        const std::optional<double> mm = millimetresOf(parts.value(at));
        if ((!isOne && parts.size() != 4) || !mm || *mm < LeastMarginMm || *mm > MostPaperMm)
            throw CommandError(
                QStringLiteral("--margins takes one length of %1 mm or more, or four "
                               "(top,right,bottom,left), not \"%2\"")
                    .arg(LeastMarginMm)
                    .arg(line.value("margins")),
                WrongUsage);
        changes.add(MarginKeys[margin], formatNumber(*mm));
    }
}

void changeFonts(const CommandLine& line, Changes& changes)
{
    if (line.has("font")) {
        const QString name = line.value("font");
        if (name.trimmed().isEmpty())
            throw CommandError(QStringLiteral("--font needs the name of a face"), WrongUsage);
        for (const TextView key : FontNameKeys)
            changes.add(key, name);
    }
    if (line.has("font-size")) {
        const double size
            = numberOf("font-size", line.value("font-size"), LeastFontSize, MostFontSize, false);
        changes.add(u"FontSize", formatNumber(size));
        // Lines of the same text are changed along; these two keep what they had.
        for (const TextView key : { u"HeaderFontSize", u"FooterFontSize" })
            changes.add(key, changes.present(key));
    }
}

/// A title is larger than the cells, unless the header font is already.
void enlargeTitle(const CommandLine& line, Changes& changes)
{
    const double body = line.has("font-size") ? line.value("font-size").toDouble()
                                              : leadingNumber(changes.present(u"FontSize"));
    if (leadingNumber(changes.present(u"HeaderFontSize")) > body)
        return;
    changes.add(u"HeaderFontSize", formatNumber(body * TitleFactor));
    changes.add(u"HeaderFontBold", QStringLiteral("1"));
}

void changeTexts(const CommandLine& line, Changes& changes)
{
    if (line.has("title") && !line.has("header-center"))
        enlargeTitle(line, changes);
    for (const TextOption& row : TextOptions) {
        if (line.has(row.option))
            changes.add(row.key, line.value(row.option));
        else if (row.key == u"HeaderCenter" && line.has("title"))
            changes.add(row.key, line.value("title"));
    }
}

/// The user's settings text, or the default one where there is none and none can be made.
Text privateSettings(const Platform& platform)
{
    const std::filesystem::path path = settingsPath(platform);
    std::error_code ignored;
    if (!std::filesystem::exists(path, ignored)) {
        try {
            deployDefaultSettings(platform);
        } catch (const RunTimeError&) {
            return defaultSettingsText();
        }
    }
    return platform.codec.decode(readFileBytes(path));
}

} // namespace

OptionTable reportOptions() { return Options; }

const char* firstReportOption(const CommandLine& line)
{
    for (const Option& option : Options) {
        if (line.has(option.name))
            return option.name;
    }
    return nullptr;
}

PrivateSettings::PrivateSettings(qt::QtPlatform& platform, const CommandLine& line)
    : platform_(platform)
{
    const Text content = privateSettings(platform.record());
    if (!folder_.isValid())
        throw CommandError(QStringLiteral("no temporary folder: %1").arg(folder_.errorString()));
    const std::filesystem::path folder = qt::toText(folder_.path());
    platform_.folders().setSystemDirectory(folder);
    const Platform record = platform_.record();
    replaceSettings(record, content);
    Changes changes(record);
    if (line.has("no-headers"))
        changes.add(u"ShowHeaders", QStringLiteral("0"));
    if (line.has("merge"))
        changes.add(u"GridMerge", QStringLiteral("1"));
    changeFonts(line, changes);
    changePaper(line, changes);
    changeMargins(line, changes);
    changeTexts(line, changes);
    changes.write(record);
}

PrivateSettings::~PrivateSettings() { platform_.folders().setSystemDirectory({}); }

} // namespace pelloric::app
