// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "controls/facade.h"
#include "controls/qt/member_calls.h"
#include "controls/qt/plain_calls.h"

#include <QVariant>

#include <functional>
#include <memory>

namespace pelloric::qt {

class CanvasAreas;
class PageGuest;
class QtPlatform;

/// The page canvas: builds pages from a grid, shows, prints, saves and opens them.
///
/// Every member is published by its name, too, and takes and answers variants there: a number that
/// does not fit is the overflow error, a value of another kind the type mismatch. No error leaves a
/// member: it becomes an error of the script that the control belongs to, or a message box.
/// Code that wants the errors themselves calls `canvas()`; the control shows what that does.
class Sorvane : public SorvaneCalls {
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

    /// The canvas without its window: the published fields, and every member with its errors.
    Canvas& canvas() { return canvas_; }
    const Canvas& canvas() const { return canvas_; }

    /// Has the pages marked on the screen, and the mouse over them seen first.
    /// @param guest  borrowed, or null for none
    void setPageGuest(PageGuest* guest);
    /// Paints the pages that are seen anew.
    void repaintPages();
    /// The texts of the pages that are seen, row by row with tabs between cells, and a form feed
    /// between pages.
    QString shownText() const;

    std::int16_t Currentpage();
    void setCurrentpage(std::int16_t page);
    float DispScale() const { return canvas_.DispScale(); }
    void setDispScale(float scale);
    void setVerticalDir(bool portrait);
    void showMuliPage(std::int16_t nPages);
    void SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage);
    void doPrint(bool bAllPrint, const QString& strPrintRange, std::int16_t nPrintPageNum);
    void SaveFile(const QString& FilePath);
    void OpenFile(const QString& FilePath);
    /// Builds the pages from a grid, which `m_PrintObj` tells the kind of, and shows them.
    /// @param PrintObj  borrowed for the build
    void doPreview(AutomationObject& PrintObj);
    /// The same from a view or any object that publishes a grid's members.
    void doPreview(QObject* PrintObj);
    /// Builds again with style and widths as the canvas holds them.
    /// @param PrintObj  borrowed for the build
    void ReDrawZoom(AutomationObject& PrintObj);
    void ReDrawZoom(QObject* PrintObj);

    Q_INVOKABLE void showWholePage();
    Q_INVOKABLE void showPage();
    Q_INVOKABLE void showAllPage();
    Q_INVOKABLE void showMuliPage(const QVariant& nPages);
    Q_INVOKABLE void clear();
    Q_INVOKABLE void zoomIn();
    Q_INVOKABLE void zoomOut();
    Q_INVOKABLE void Minimum();
    Q_INVOKABLE void Maximum();
    Q_INVOKABLE void setMouse();
    Q_INVOKABLE void Pan();
    Q_INVOKABLE void doPrint(
        const QVariant& bAllPrint, const QVariant& strPrintRange, const QVariant& nPrintPageNum);
    Q_INVOKABLE void doPreview(const QVariant& PrintObj);
    Q_INVOKABLE void SetShowStyle(
        const QVariant& nPages, const QVariant& nStartPage, const QVariant& nEndPage);
    Q_INVOKABLE QVariant WindowMinPage() const;
    Q_INVOKABLE QVariant WindowMaxPage() const;
    Q_INVOKABLE QVariant WindowPages() const;
    Q_INVOKABLE QVariant WindowOrderStyle() const;
    Q_INVOKABLE void OnDraw();
    Q_INVOKABLE void SaveFile(const QVariant& FilePath);
    Q_INVOKABLE void OpenFile(const QVariant& FilePath);
    Q_INVOKABLE void ReDrawZoom(const QVariant& PrintObj);

    QSize sizeHint() const override;
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
    QVariant getIntTop() const { return QVariant::fromValue(canvas_.page.intTop); }
    QVariant getIntButtom() const { return QVariant::fromValue(canvas_.page.intButtom); }
    QVariant getIntLeft() const { return QVariant::fromValue(canvas_.page.intLeft); }
    QVariant getIntRight() const { return QVariant::fromValue(canvas_.page.intRight); }
    QVariant getMyHeight() const { return canvas_.page.myHeight; }
    QVariant getMyWidth() const { return canvas_.page.myWidth; }
    QVariant getTotalpages() const { return QVariant::fromValue(canvas_.Totalpages()); }
    QVariant getBGetText() const { return canvas_.bGetText; }
    QVariant getPrintObj() const;
    QVariant getStrSCliectRect() const;
    QVariant getCurrentpage();
    QVariant getCurrentX() const { return canvas_.CurrentX(); }
    QVariant getCurrentY() const { return canvas_.CurrentY(); }
    QVariant getDispScale() const { return canvas_.DispScale(); }
    QVariant getVerticalDir();
    QVariant getPageHeader() const;
    QVariant getReSetLeftTop() const { return canvas_.ReSetLeftTop(); }

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

    struct Parts;

    void run(const std::function<void()>& member) { calls_.run(member); }

    std::shared_ptr<Parts> parts_; ///< shared with the members that run
    Canvas& canvas_; ///< one of the parts
    MemberCalls calls_;
    std::unique_ptr<CanvasAreas> areas_;
};

} // namespace pelloric::qt
