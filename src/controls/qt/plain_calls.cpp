// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/plain_calls.h"

#include "controls/canvas.h"
#include "controls/facade.h"

#include <pelloric/kestrane.h>
#include <pelloric/sorvane.h>

#include <QMetaType>

namespace pelloric::qt {

namespace {

/// By the name that the interface gives the record and by the one that the compiler knows.
template <typename Record> void registerRecord(const char* name)
{
    qRegisterMetaType<Record>();
    qRegisterMetaType<Record>(name);
}

} // namespace

QVariant SorvaneCalls::WindowMinPage() const
{
    return QVariant::fromValue(static_cast<const Sorvane&>(*this).WindowMinPage());
}

QVariant SorvaneCalls::WindowMaxPage() const
{
    return QVariant::fromValue(static_cast<const Sorvane&>(*this).WindowMaxPage());
}

QVariant SorvaneCalls::WindowPages() const
{
    return QVariant::fromValue(static_cast<const Sorvane&>(*this).WindowPages());
}

QVariant SorvaneCalls::WindowOrderStyle() const
{
    return static_cast<int>(static_cast<const Sorvane&>(*this).WindowOrderStyle());
}

void SorvaneCalls::showMuliPage(short nPages)
{
    static_cast<Sorvane&>(*this).showMuliPage(QVariant::fromValue(nPages));
}

void SorvaneCalls::showMuliPage(int nPages)
{
    static_cast<Sorvane&>(*this).showMuliPage(QVariant::fromValue(nPages));
}

void SorvaneCalls::doPrint(bool bAllPrint, const QString& strPrintRange, short nPrintPageNum)
{
    static_cast<Sorvane&>(*this).doPrint(QVariant::fromValue(bAllPrint), QVariant(strPrintRange),
        QVariant::fromValue(nPrintPageNum));
}

void SorvaneCalls::doPrint(bool bAllPrint, const QString& strPrintRange, int nPrintPageNum)
{
    static_cast<Sorvane&>(*this).doPrint(QVariant::fromValue(bAllPrint), QVariant(strPrintRange),
        QVariant::fromValue(nPrintPageNum));
}

void SorvaneCalls::doPreview(QObject* PrintObj)
{
    static_cast<Sorvane&>(*this).doPreview(PrintObj);
}

void SorvaneCalls::SetShowStyle(short nPages, short nStartPage, short nEndPage)
{
    static_cast<Sorvane&>(*this).SetShowStyle(QVariant::fromValue(nPages),
        QVariant::fromValue(nStartPage), QVariant::fromValue(nEndPage));
}

void SorvaneCalls::SetShowStyle(int nPages, int nStartPage, int nEndPage)
{
    static_cast<Sorvane&>(*this).SetShowStyle(QVariant::fromValue(nPages),
        QVariant::fromValue(nStartPage), QVariant::fromValue(nEndPage));
}

void SorvaneCalls::SaveFile(const QString& FilePath)
{
    static_cast<Sorvane&>(*this).SaveFile(QVariant(FilePath));
}

void SorvaneCalls::OpenFile(const QString& FilePath)
{
    static_cast<Sorvane&>(*this).OpenFile(QVariant(FilePath));
}

void SorvaneCalls::ReDrawZoom(QObject* PrintObj)
{
    static_cast<Sorvane&>(*this).ReDrawZoom(PrintObj);
}

void KestraneCalls::doPreview(QObject* PrintObj)
{
    static_cast<Kestrane&>(*this).doPreview(PrintObj);
}

void KestraneCalls::AddHeader(const QString& strHeader, short Location)
{
    static_cast<Kestrane&>(*this).AddHeader(QVariant(strHeader), QVariant::fromValue(Location));
}

void KestraneCalls::AddHeader(const QString& strHeader, int Location)
{
    static_cast<Kestrane&>(*this).AddHeader(QVariant(strHeader), QVariant::fromValue(Location));
}

void KestraneCalls::AddFooter(const QString& strFooter, short Location)
{
    static_cast<Kestrane&>(*this).AddFooter(QVariant(strFooter), QVariant::fromValue(Location));
}

void KestraneCalls::AddFooter(const QString& strFooter, int Location)
{
    static_cast<Kestrane&>(*this).AddFooter(QVariant(strFooter), QVariant::fromValue(Location));
}

void registerRecords()
{
    registerRecord<Tpoint>("Tpoint");
    registerRecord<Lineobj>("Lineobj");
    registerRecord<Textobj>("Textobj");
    registerRecord<MapLocation>("MapLocation");
    registerRecord<ColPos>("ColPos");
    registerRecord<MuliPageType>("MuliPageType");
}

} // namespace pelloric::qt
