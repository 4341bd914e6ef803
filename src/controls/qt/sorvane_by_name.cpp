// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// The members of the control as hosts find them by name, with values of any type.

#include <pelloric/sorvane.h>

#include "controls/canvas.h"
#include "controls/qt/published_values.h"
#include "platform/automation_object.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_text.h"

namespace pelloric::qt {

void Sorvane::showMuliPage(const QVariant& nPages)
{
    run([&] { canvas().showMuliPage(toInt16(nPages)); });
}

void Sorvane::doPrint(
    const QVariant& bAllPrint, const QVariant& strPrintRange, const QVariant& nPrintPageNum)
{
    run([&] {
        const QString range = toPlainText(strPrintRange);
        canvas().doPrint(toTruth(bAllPrint), viewOf(range), toInt16(nPrintPageNum));
    });
}

void Sorvane::doPreview(const QVariant& PrintObj)
{
    run([&] { preview(toGrid(PrintObj, *this)); });
}

void Sorvane::SetShowStyle(
    const QVariant& nPages, const QVariant& nStartPage, const QVariant& nEndPage)
{
    run([&] { canvas().SetShowStyle(toInt16(nPages), toInt16(nStartPage), toInt16(nEndPage)); });
}

void Sorvane::SaveFile(const QVariant& FilePath)
{
    run([&] { canvas().SaveFile(pathOf(toPlainText(FilePath))); });
}

void Sorvane::OpenFile(const QVariant& FilePath)
{
    run([&] { canvas().OpenFile(pathOf(toPlainText(FilePath))); });
}

void Sorvane::ReDrawZoom(const QVariant& PrintObj)
{
    run([&] { redraw(toGrid(PrintObj, *this)); });
}

QVariant Sorvane::getPrintObj() const { return static_cast<int>(canvas().m_PrintObj); }

QVariant Sorvane::getStrSCliectRect() const { return toQString(canvas().strSCliectRect); }

QVariant Sorvane::getCurrentpage() { return QVariant::fromValue(Currentpage()); }

QVariant Sorvane::getPageHeader() const { return toQString(canvas().PageHeader); }

void Sorvane::putIntTop(const QVariant& value)
{
    run([&] { canvas().page.intTop = toInt16(value); });
}

void Sorvane::putIntButtom(const QVariant& value)
{
    run([&] { canvas().page.intButtom = toInt16(value); });
}

void Sorvane::putIntLeft(const QVariant& value)
{
    run([&] { canvas().page.intLeft = toInt16(value); });
}

void Sorvane::putIntRight(const QVariant& value)
{
    run([&] { canvas().page.intRight = toInt16(value); });
}

void Sorvane::putMyHeight(const QVariant& value)
{
    run([&] { canvas().page.myHeight = toInt32(value); });
}

void Sorvane::putMyWidth(const QVariant& value)
{
    run([&] { canvas().page.myWidth = toInt32(value); });
}

void Sorvane::putTotalpages(const QVariant& value)
{
    run([&] { canvas().setTotalpages(toInt16(value)); });
}

void Sorvane::putBGetText(const QVariant& value)
{
    run([&] { canvas().bGetText = toTruth(value); });
}

void Sorvane::putPrintObj(const QVariant& value)
{
    run([&] { canvas().m_PrintObj = static_cast<pelloric::PrintObjKind>(toInt16(value)); });
}

void Sorvane::putStrSCliectRect(const QVariant& value)
{
    run([&] { canvas().strSCliectRect = toText(toPlainText(value)); });
}

void Sorvane::putCurrentpage(const QVariant& value)
{
    run([&] { canvas().setCurrentpage(toInt16(value)); });
}

void Sorvane::putCurrentX(const QVariant& value)
{
    run([&] { canvas().setCurrentX(toInt32(value)); });
}

void Sorvane::putCurrentY(const QVariant& value)
{
    run([&] { canvas().setCurrentY(toInt32(value)); });
}

void Sorvane::putDispScale(const QVariant& value)
{
    run([&] { canvas().setDispScale(toSingle(value)); });
}

void Sorvane::putVerticalDir(const QVariant& value)
{
    run([&] { canvas().setVerticalDir(toTruth(value)); });
}

void Sorvane::putPageHeader(const QVariant& value)
{
    run([&] { canvas().PageHeader = toText(toPlainText(value)); });
}

void Sorvane::putReSetLeftTop(const QVariant& value)
{
    run([&] { canvas().setReSetLeftTop(toTruth(value)); });
}

QVariant Sorvane::getIntTop() const { return QVariant::fromValue(canvas().page.intTop); }

QVariant Sorvane::getIntButtom() const { return QVariant::fromValue(canvas().page.intButtom); }

QVariant Sorvane::getIntLeft() const { return QVariant::fromValue(canvas().page.intLeft); }

QVariant Sorvane::getIntRight() const { return QVariant::fromValue(canvas().page.intRight); }

QVariant Sorvane::getMyHeight() const { return canvas().page.myHeight; }

QVariant Sorvane::getMyWidth() const { return canvas().page.myWidth; }

QVariant Sorvane::getTotalpages() const { return QVariant::fromValue(canvas().Totalpages()); }

QVariant Sorvane::getBGetText() const { return canvas().bGetText; }

QVariant Sorvane::getCurrentX() const { return canvas().CurrentX(); }

QVariant Sorvane::getCurrentY() const { return canvas().CurrentY(); }

QVariant Sorvane::getDispScale() const { return canvas().DispScale(); }

QVariant Sorvane::getReSetLeftTop() const { return canvas().ReSetLeftTop(); }

} // namespace pelloric::qt
