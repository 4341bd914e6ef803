// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/spooler.h"

#include "export/qt/qt_glyph_faces.h"
#include "export/qt/qt_pdf_writer.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/units.h"
#include "print/qt/held_pages.h"
#include "view/joined_lines.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QInputDialog>
#include <QPdfWriter>
#include <QTemporaryFile>
#include <QThread>

#include <cups/cups.h>
#include <cups/ppd.h>

#include <memory>

namespace pelloric::qt {

namespace {

/// For each step of asking for a sign of life: milliseconds.
constexpr int AnswerMs = 2500;

/// Fine enough that the thinnest line is 0.12 points wide, and coarse enough that it is seen.
constexpr int Resolution = 600;
constexpr double Pixel = 1440.0 / Resolution; ///< twips

struct FreeDestination {
    void operator()(cups_dest_t* destination) const { cupsFreeDests(1, destination); }
};
using Destination = std::unique_ptr<cups_dest_t, FreeDestination>;

/// An option as the scheduler writes it, and what it means for a job.
struct RefusingState {
    const char* option;
    const char* value;
    TextView meaning; ///< a phrase
};

/// In the order in which they are told.
constexpr RefusingState RefusingStates[] = {
    { "printer-is-accepting-jobs", "false", phraseText(u"the printer rejects jobs") },
    { "printer-state", "5", phraseText(u"the printer is stopped") },
};

QString queueOf(const QString& printer) { return printer.section(u'/', 0, 0); }

Destination destinationOf(const QString& printer)
{
    const QByteArray name = queueOf(printer).toLocal8Bit();
    const QByteArray instance = printer.section(u'/', 1).toLocal8Bit();
    return Destination(cupsGetNamedDest(
        CUPS_HTTP_DEFAULT, name.constData(), instance.isEmpty() ? nullptr : instance.constData()));
}

const char* optionOf(const Destination& destination, const char* option)
{
    return destination ? cupsGetOption(option, destination->num_options, destination->options)
                       : nullptr;
}

QString lastError() { return QString::fromUtf8(cupsLastErrorString()); }

QString noAnswer() { return phrased(u"the print system does not answer (%1)", { lastError() }); }

int giveUp(http_t*, void*) { return 0; }

const char* noPassword(const char*, http_t*, const char*, const char*, void*) { return nullptr; }

/// Asks the person before the screen; a program without windows leaves that to the print system.
const char* askPassword(const char* prompt, http_t*, const char*, const char*, void*)
{
    static QByteArray password;
    bool isGiven = false;
    password = QInputDialog::getText(QApplication::activeWindow(),
        QApplication::applicationDisplayName(), QString::fromLocal8Bit(prompt), QLineEdit::Password,
        {}, &isGiven)
                   .toLocal8Bit();
    return isGiven ? password.constData() : nullptr;
}

/// A file that goes with its owner.
class WaitingFile {
public:
    explicit WaitingFile(QString path)
        : path_(std::move(path))
    {
    }
    ~WaitingFile() { QFile::remove(path_); }
    WaitingFile(const WaitingFile&) = delete;
    WaitingFile& operator=(const WaitingFile&) = delete;

    QByteArray name() const { return QFile::encodeName(path_); }

private:
    QString path_;
};

/// Drawn as PDF into a file of its own, which is sent when it is complete.
///
/// A font that must not be sent along leaves the drawing to the toolkit, which draws its characters
/// as shapes.
class PdfDocument final : public SpoolDocument {
public:
    explicit PdfDocument(const SpoolOrder& order)
        : order_(order)
        , file_(QDir::tempPath() + QStringLiteral("/pelloric"))
    {
    }

    /// Without a folder of temporary files the name would be one of the root.
    bool open() { return !QDir::tempPath().isEmpty() && file_.open(); }

    bool draw(const std::vector<HeldDrawing>& pages, const SpoolFonts& fonts) override
    {
        const bool isWhole
            = drawInto(pages, fonts) && file_.flush() && file_.error() == QFileDevice::NoError;
        // It is sent from another thread, which a file object must not go to.
        waiting_ = std::make_unique<WaitingFile>(file_.fileName());
        file_.setAutoRemove(false);
        file_.close();
        return isWhole;
    }

    QString handOver() override
    {
        cups_option_t* options = nullptr;
        int count = cupsAddOption("media", order_.sheet.paper.key().toLocal8Bit(), 0, &options);
        count = cupsAddOption("sides", "one-sided", count, &options);
        if (order_.sheet.orientation == QPageLayout::Landscape)
            count = cupsAddOption("landscape", "", count, &options);
        if (QThread::currentThread() == QCoreApplication::instance()->thread()
            && qobject_cast<QApplication*>(QCoreApplication::instance()))
            cupsSetPasswordCB2(askPassword, nullptr);
        const int job = cupsPrintFile(queueOf(order_.printer).toLocal8Bit(), waiting_->name(),
            order_.title.toUtf8(), count, options);
        cupsFreeOptions(count, options);
        return job != 0
            ? QString()
            : phrased(u"the print system did not take the document (%1)", { lastError() });
    }

private:
    bool drawInto(const std::vector<HeldDrawing>& pages, const SpoolFonts& fonts)
    {
        try {
            return drawByStreams(pages, fonts.faces);
        } catch (const pdf::CannotEmbed&) {
            return file_.resize(0) && file_.seek(0) && drawByToolkit(pages, fonts.fonts);
        }
    }

    /// @throws CannotEmbed
    bool drawByStreams(const std::vector<HeldDrawing>& pages, QtGlyphFaces& faces)
    {
        const QPageLayout sheet = layout();
        const QSize size = sheet.fullRectPoints().size() * TwipsPerPoint;
        const QPointF origin = sheet.paintRect(QPageLayout::Point).topLeft() * TwipsPerPoint;
        const pdf::Paper paper { .width = size.width(),
            .height = size.height(),
            .origin = { qRound(origin.x()), qRound(origin.y()) } };
        const auto write = [&](pdf::PdfWriter& writer) {
            for (const HeldDrawing& page : pages) {
                JoinedLines joined(writer.beginPage(paper));
                page.drawOn(joined);
                joined.finish();
                writer.endPage();
            }
        };
        return writePdf(file_, faces, pdfInfoOfNow(toText(order_.title)), Pixel, write);
    }

    bool drawByToolkit(const std::vector<HeldDrawing>& pages, QtFonts& fonts)
    {
        QPdfWriter writer(&file_);
        writer.setResolution(Resolution);
        writer.setTitle(order_.title);
        writer.setPageLayout(layout());
        return paintHeldPages(pages, writer, fonts);
    }

    QPageLayout layout() const
    {
        return QPageLayout(order_.sheet.paper, order_.sheet.orientation, order_.sheet.edges,
            QPageLayout::Point, QMarginsF());
    }

    SpoolOrder order_;
    QTemporaryFile file_;
    std::unique_ptr<WaitingFile> waiting_;
};

} // namespace

void prepareCallingThread() { cupsSetPasswordCB2(noPassword, nullptr); }

QString silenceOfSystem()
{
    http_t* const connection = httpConnect2(
        cupsServer(), ippPort(), nullptr, AF_UNSPEC, cupsEncryption(), 1, AnswerMs, nullptr);
    if (connection == nullptr)
        return noAnswer();
    httpSetTimeout(connection, AnswerMs / 1000.0, giveUp, nullptr);
    ipp_t* const response = cupsDoRequest(connection, ippNewRequest(IPP_OP_CUPS_GET_DEFAULT), "/");
    const QString silence = response == nullptr ? noAnswer() : QString();
    ippDelete(response);
    httpClose(connection);
    return silence;
}

QString refusalOf(const QString& printer)
{
    if (printer.isEmpty())
        return phrased(u"there is no printer");
    const Destination destination = destinationOf(printer);
    if (!destination) {
        const QString silence = silenceOfSystem();
        return silence.isEmpty() ? phrased(u"there is no such printer") : silence;
    }
    for (const RefusingState& state : RefusingStates) {
        const char* const value = optionOf(destination, state.option);
        if (value != nullptr && qstrcmp(value, state.value) == 0)
            return phrased(state.meaning);
    }
    return {};
}

bool asksForPassword(const QString& printer)
{
    const Destination destination = destinationOf(printer);
    const QByteArray required(optionOf(destination, "auth-info-required"));
    return !required.isEmpty() && required != "none" && required != "negotiate";
}

// Only the description of the printer says which way its pages are turned, and it is read with the
// print system's older functions.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

bool turnsClockwise(const QString& printer)
{
    const char* const name = cupsGetPPD(queueOf(printer).toLocal8Bit());
    if (name == nullptr)
        return false;
    const QString file = QFile::decodeName(name);
    ppd_file_t* const description = ppdOpenFile(name);
    const bool isClockwise = description != nullptr && description->landscape < 0;
    ppdClose(description);
    QFile::remove(file);
    return isClockwise;
}

#pragma GCC diagnostic pop

std::unique_ptr<SpoolDocument> newSpoolDocument(const SpoolOrder& order)
{
    auto document = std::make_unique<PdfDocument>(order);
    if (!document->open())
        return nullptr;
    return document;
}

} // namespace pelloric::qt
