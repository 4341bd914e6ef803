// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// `Sorvane`, the page canvas, for hosts that put it on a form of their own.
///
/// @code
/// auto* canvas = new pelloric::qt::Sorvane(form);
/// canvas->doPreview(tableView);
/// canvas->showWholePage();
/// @endcode

#include <pelloric/options.h>
#include <pelloric/records.h>
#include <pelloric/version.h>

#include <QVariant>
#include <QWidget>

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>

namespace pelloric {

class AutomationObject;
class Canvas;

} // namespace pelloric

namespace pelloric::qt {

class PageGuest;
class QtPlatform;

/// What a program may hand to members of `Sorvane` by name besides variants, as in
/// `QMetaObject::invokeMethod(canvas, "SaveFile", Q_ARG(QString, path))`.
///
/// Each checks its numbers as the member itself does. They are private, so that no script sees
/// them: it would take the overload of the narrowest type and wrap a number that does not fit.
class PELLORIC_EXPORT SorvaneCalls : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;

    /// The members of these names of `Sorvane`, as callers by name get them.
    Q_INVOKABLE QVariant WindowMinPage() const;
    /// The same.
    Q_INVOKABLE QVariant WindowMaxPage() const;
    /// The same.
    Q_INVOKABLE QVariant WindowPages() const;
    /// The same: the number of an `OrderStyle`.
    Q_INVOKABLE QVariant WindowOrderStyle() const;

private:
    Q_INVOKABLE void showMuliPage(short nPages);
    Q_INVOKABLE void showMuliPage(int nPages);
    Q_INVOKABLE void doPrint(bool bAllPrint, const QString& strPrintRange, short nPrintPageNum);
    Q_INVOKABLE void doPrint(bool bAllPrint, const QString& strPrintRange, int nPrintPageNum);
    Q_INVOKABLE void doPreview(QObject* PrintObj);
    Q_INVOKABLE void SetShowStyle(short nPages, short nStartPage, short nEndPage);
    Q_INVOKABLE void SetShowStyle(int nPages, int nStartPage, int nEndPage);
    Q_INVOKABLE void SaveFile(const QString& FilePath);
    Q_INVOKABLE void OpenFile(const QString& FilePath);
    Q_INVOKABLE void ReDrawZoom(QObject* PrintObj);
};

/// The page canvas: builds pages from a grid, shows, prints, saves and opens them.
///
/// Every member is published by its name, too, and takes and answers variants there: a number that
/// does not fit is the overflow error, a value of another kind the type mismatch. No error leaves a
/// member: it becomes an error of the script that the control belongs to, or a message box.
///
/// A member whose name is that of a field answers it, and its `set` writes it.
class PELLORIC_EXPORT Sorvane : public SorvaneCalls {
    Q_OBJECT
    Q_PROPERTY(QVariant intTop READ getIntTop WRITE putIntTop DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant intButtom READ getIntButtom WRITE putIntButtom DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant intLeft READ getIntLeft WRITE putIntLeft DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant intRight READ getIntRight WRITE putIntRight DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant myHeight READ getMyHeight WRITE putMyHeight DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant myWidth READ getMyWidth WRITE putMyWidth DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant Totalpages READ getTotalpages WRITE putTotalpages DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant bGetText READ getBGetText WRITE putBGetText DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant m_PrintObj READ getPrintObj WRITE putPrintObj DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant strSCliectRect READ getStrSCliectRect WRITE putStrSCliectRect
            DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant Currentpage READ getCurrentpage WRITE putCurrentpage DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant CurrentX READ getCurrentX WRITE putCurrentX DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant CurrentY READ getCurrentY WRITE putCurrentY DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant DispScale READ getDispScale WRITE putDispScale DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant VerticalDir READ getVerticalDir WRITE putVerticalDir DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant PageHeader READ getPageHeader WRITE putPageHeader DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant ReSetLeftTop READ getReSetLeftTop WRITE putReSetLeftTop
            DESIGNABLE false STORED false)

public:
    /// Display modes, by name for scripts.
    enum OrderStyle { Whole, One, Two, Four, Multiple, UserCustom, Six };
    Q_ENUM(OrderStyle)

    /// Kinds of grids, by name for scripts.
    enum PrintObjKind { MSHFlexGrid, MSFlexGrid, ListView, datagrid };
    Q_ENUM(PrintObjKind)

    /// A canvas on the default services.
    Q_INVOKABLE explicit Sorvane(QWidget* parent = nullptr);
    /// @param platform  outlives the control
    explicit Sorvane(QtPlatform& platform, QWidget* parent = nullptr);
    ~Sorvane() override;

    /// Gives reports settings of their own: the settings file is not read for them then.
    /// @param settings  nothing: the file's hold again, from the next build on
    void useSettings(std::optional<ReportSettings> settings);

    /// What reports are to do beyond the plain page, from the next build on.
    void setReportOptions(const ReportOptions& options);
    /// What was set; everything is off at first.
    const ReportOptions& reportOptions() const;
    /// What was done to bring the table of the last build onto the sheet.
    FitResult fitResult() const;
    /// The cells that the totals of the last build leave out, because they show no number.
    std::vector<LeftOut> leftOutOfTotals() const;

    /// Margins: twips (1440 an inch), 1134 at first; a build takes those of the settings.
    std::int16_t intTop() const;
    /// Writes what the member of that name answers.
    void setintTop(std::int16_t twips);
    /// See `intTop`.
    std::int16_t intButtom() const;
    /// Writes what the member of that name answers.
    void setintButtom(std::int16_t twips);
    /// See `intTop`.
    std::int16_t intLeft() const;
    /// Writes what the member of that name answers.
    void setintLeft(std::int16_t twips);
    /// See `intTop`.
    std::int16_t intRight() const;
    /// Writes what the member of that name answers.
    void setintRight(std::int16_t twips);

    /// Size of the pages: twips, 16840 by 11907 (A4) at first; a build takes that of the settings.
    std::int32_t myHeight() const;
    /// Writes what the member of that name answers.
    void setmyHeight(std::int32_t twips);
    /// See `myHeight`.
    std::int32_t myWidth() const;
    /// Writes what the member of that name answers.
    void setmyWidth(std::int32_t twips);

    /// The number of pages, 1 at first. What is written holds until pages are added or opened.
    std::int16_t Totalpages() const;
    /// Writes what the member of that name answers.
    void setTotalpages(std::int16_t pages);

    /// For the host; the control only gives it its first value, false.
    bool bGetText() const;
    /// Writes what the member of that name answers.
    void setbGetText(bool getText);

    /// The kind of grid that a build reads, `MSHFlexGrid` at first.
    PrintObjKind m_PrintObj() const;
    /// Writes what the member of that name answers.
    void setm_PrintObj(PrintObjKind kind);

    /// While it is "small", as at first, no page is painted.
    QString strSCliectRect() const;
    /// Writes what the member of that name answers.
    void setstrSCliectRect(const QString& size);

    /// The current page, from 1; after an error 0.
    std::int16_t Currentpage();
    /// A number above `Totalpages` shows a message and changes nothing; one below 1 is stored and
    /// fails when the page is used.
    void setCurrentpage(std::int16_t page);

    /// The current point of the page being recorded: twips.
    std::int32_t CurrentX() const;
    /// Writes what the member of that name answers.
    void setCurrentX(std::int32_t x);
    /// See `CurrentX`.
    std::int32_t CurrentY() const;
    /// Writes what the member of that name answers.
    void setCurrentY(std::int32_t y);

    /// The display divisor: the reciprocal of the scale that was written, 1 at first.
    float DispScale() const;
    /// Shows the pages at a scale; 1 is full size, 0 the error of a division by zero.
    void setDispScale(float scale);

    /// Turns the page: true is portrait, false landscape. It cannot be read.
    void setVerticalDir(bool portrait);

    /// Kept for the host; a build takes its header texts from the settings.
    QString PageHeader() const;
    /// Writes what the member of that name answers.
    void setPageHeader(const QString& text);

    /// Whether the next `showPage` centres the page; it is false again then.
    bool ReSetLeftTop() const;
    /// Writes what the member of that name answers.
    void setReSetLeftTop(bool centre);

    /// Shows 2, 4 or 6 pages side by side; any other number changes nothing.
    void showMuliPage(std::int16_t nPages);
    /// Sets the window of pages that several-page modes show.
    void SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage);

    /// The first page of the window of pages, from 0; 0 at first.
    std::int16_t WindowMinPage() const;
    /// Its last page, from 0; 0 at first.
    std::int16_t WindowMaxPage() const;
    /// How many pages it shows, as `SetShowStyle` was told; 0, as at first: there is none.
    std::int16_t WindowPages() const;
    /// The display mode in force, `One` at first.
    OrderStyle WindowOrderStyle() const;

    /// Prints on the current printer; before a build the one empty page.
    /// @param bAllPrint      false: the pages of the list
    /// @param strPrintRange  page numbers from 1, separated by ","; what is no page is passed over
    /// @param nPrintPageNum  copies, despite its name; below 1 nothing is printed
    void doPrint(bool bAllPrint, const QString& strPrintRange, std::int16_t nPrintPageNum);

    /// Writes the pages to a document file, which holds 131 at most. It says nothing: neither that
    /// there are more pages, nor that it could not write.
    void SaveFile(const QString& FilePath);
    /// Reads a document file and shows its first page; one that is none shows a message and leaves
    /// the canvas empty.
    void OpenFile(const QString& FilePath);

    /// Builds the pages from a grid, which `m_PrintObj` tells the kind of, and shows them.
    /// @param PrintObj  borrowed for the build
    void doPreview(AutomationObject& PrintObj);
    /// The same from a view or any object that publishes a grid's members; see grids.h.
    void doPreview(QObject* PrintObj);
    /// Builds again with style and widths as the canvas holds them; before a build an error.
    /// @param PrintObj  borrowed for the build
    void ReDrawZoom(AutomationObject& PrintObj);
    /// The same for an object that publishes a grid's members.
    void ReDrawZoom(QObject* PrintObj);

    /// What the control shows, without its window; for the library itself.
    Canvas& canvas();
    /// The same, to be read.
    const Canvas& canvas() const;

    /// Has the pages marked on the screen, and the mouse over them seen first; for the library
    /// itself.
    /// @param guest  borrowed, or null for none
    void setPageGuest(PageGuest* guest);
    /// Paints the pages that are seen anew.
    void repaintPages();
    /// The texts of the pages that are seen, row by row with tabs between cells, and a form feed
    /// between pages.
    QString shownText() const;

    /// Fits one whole page into the viewport.
    Q_INVOKABLE void showWholePage();
    /// Shows the current page alone, at the present scale.
    Q_INVOKABLE void showPage();
    /// Shows all pages side by side, as small as that takes.
    Q_INVOKABLE void showAllPage();
    /// The members below are those above for callers by name: variants that are checked.
    Q_INVOKABLE void showMuliPage(const QVariant& nPages);
    /// Empties the document: one empty page.
    Q_INVOKABLE void clear();
    /// Doubles the display divisor: pages look half as large.
    Q_INVOKABLE void zoomIn();
    /// Halves the display divisor: pages look twice as large.
    Q_INVOKABLE void zoomOut();
    /// Makes column widths and text a tenth smaller at the next `ReDrawZoom`; before a build an
    /// error.
    Q_INVOKABLE void Minimum();
    /// Makes them a tenth larger.
    Q_INVOKABLE void Maximum();
    /// Leaves pan mode.
    Q_INVOKABLE void setMouse();
    /// Enters pan mode: the pages follow the mouse while a button is down.
    Q_INVOKABLE void Pan();
    /// The same for an object that publishes a grid's members.
    Q_INVOKABLE void doPrint(
        const QVariant& bAllPrint, const QVariant& strPrintRange, const QVariant& nPrintPageNum);
    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void doPreview(const QVariant& PrintObj);
    /// The same for an object that publishes a grid's members.
    Q_INVOKABLE void SetShowStyle(
        const QVariant& nPages, const QVariant& nStartPage, const QVariant& nEndPage);
    /// Lays the pages out again at the present scale and paints them.
    Q_INVOKABLE void OnDraw();
    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void SaveFile(const QVariant& FilePath);
    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void OpenFile(const QVariant& FilePath);
    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void ReDrawZoom(const QVariant& PrintObj);

    /// As every widget has it.
    QSize sizeHint() const override;
    /// As every widget has it.
    QSize minimumSizeHint() const override;

signals:
    /// The right mouse button (2) goes down on a page.
    void Click(short Button);
    /// The right mouse button (2) is released over a page.
    void MouseUp(short Button);

protected:
    bool event(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    QVariant getIntTop() const;
    QVariant getIntButtom() const;
    QVariant getIntLeft() const;
    QVariant getIntRight() const;
    QVariant getMyHeight() const;
    QVariant getMyWidth() const;
    QVariant getTotalpages() const;
    QVariant getBGetText() const;
    QVariant getPrintObj() const;
    QVariant getStrSCliectRect() const;
    QVariant getCurrentpage();
    QVariant getCurrentX() const;
    QVariant getCurrentY() const;
    QVariant getDispScale() const;
    QVariant getVerticalDir();
    QVariant getPageHeader() const;
    QVariant getReSetLeftTop() const;

    void putIntTop(const QVariant& value);
    void putIntButtom(const QVariant& value);
    void putIntLeft(const QVariant& value);
    void putIntRight(const QVariant& value);
    void putMyHeight(const QVariant& value);
    void putMyWidth(const QVariant& value);
    void putTotalpages(const QVariant& value);
    void putBGetText(const QVariant& value);
    void putPrintObj(const QVariant& value);
    void putStrSCliectRect(const QVariant& value);
    void putCurrentpage(const QVariant& value);
    void putCurrentX(const QVariant& value);
    void putCurrentY(const QVariant& value);
    void putDispScale(const QVariant& value);
    void putVerticalDir(const QVariant& value);
    void putPageHeader(const QVariant& value);
    void putReSetLeftTop(const QVariant& value);

    void preview(std::unique_ptr<AutomationObject> grid);
    void redraw(std::unique_ptr<AutomationObject> grid);

    void run(const std::function<void()>& member);

    struct Parts;
    std::unique_ptr<Parts> parts_;
};

} // namespace pelloric::qt
