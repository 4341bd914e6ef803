// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/kestrane.h>
#include <pelloric/sorvane.h>

#include "controls/qt/sorvane_world.h"
#include "support/show_document.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"

#include <QPointer>
#include <QSettings>
#include <QStandardItemModel>
#include <QTableView>
#include <QTreeView>

#include <gtest/gtest.h>

#include <array>

namespace pelloric::qt {

namespace {

/// Does something in the message-loop pass of some number, counted from now on.
class InPass : public QObject {
public:
    InPass(int pass, std::function<void()> action)
        : left_(pass)
        , action_(std::move(action))
    {
        post();
    }

    bool event(QEvent* event) override
    {
        if (event->type() != QEvent::User)
            return QObject::event(event);
        if (--left_ > 0)
            post();
        else
            action_();
        return true;
    }

    bool isDone() const { return left_ <= 0; }

private:
    void post() { QCoreApplication::postEvent(this, new QEvent(QEvent::User)); }

    int left_;
    std::function<void()> action_;
};

/// A column of a host's data grid.
class HostColumn : public QObject {
    Q_OBJECT
    Q_PROPERTY(double Width MEMBER width)

public:
    double width = 2000;
};

class HostColumns : public QObject {
    Q_OBJECT
    Q_PROPERTY(int Count READ count CONSTANT)

public:
    int count() const { return 1; }
    Q_INVOKABLE QObject* Item(int) { return &column_; }

private:
    HostColumn column_;
};

/// A host's data grid, whose model is walked in place.
class HostDataGrid : public QWidget {
    Q_OBJECT
    Q_PROPERTY(QAbstractItemModel* DataSource READ source CONSTANT)
    Q_PROPERTY(QObject* Columns READ columns CONSTANT)
    Q_PROPERTY(int col MEMBER col)

public:
    HostDataGrid(QAbstractItemModel& model, QWidget* parent)
        : QWidget(parent)
        , model_(&model)
    {
    }

    QAbstractItemModel* source() { return model_; }
    QObject* columns() { return &columns_; }

    int col = 0;

private:
    QPointer<QAbstractItemModel> model_;
    HostColumns columns_;
};

using MakeGrid = QWidget* (*)(QAbstractItemModel&, QWidget*);

template <typename View> QWidget* viewOn(QAbstractItemModel& model, QWidget* parent)
{
    auto* const view = new View(parent);
    view->setModel(&model);
    return view;
}

/// A kind of grid that a host has on its form.
struct GridRow {
    const char* name;
    PrintObjKind kind;
    MakeGrid make;
};

constexpr auto Grids = std::to_array<GridRow>({
    { "table", PrintObjKind::MSFlexGrid, &viewOn<QTableView> },
    { "tree", PrintObjKind::ListView, &viewOn<QTreeView> },
    { "data grid", PrintObjKind::datagrid,
        [](QAbstractItemModel& model, QWidget* parent) -> QWidget* {
            return new HostDataGrid(model, parent);
        } },
});

/// A host: a form with a grid and both controls on it.
struct Host {
    Host(QuietPlatform& platform, const GridRow& grid)
        : form(new QWidget)
        , model(new QStandardItemModel(3, 1, form))
        , view(grid.make(*model, form))
        , sorvane(new Sorvane(platform, form))
        , kestrane(new Kestrane(platform, form))
    {
        sorvane->canvas().m_PrintObj = grid.kind;
        form->show();
        QCoreApplication::processEvents();
    }

    ~Host() { delete form; }
    Host(const Host&) = delete;
    Host& operator=(const Host&) = delete;

    QPointer<QWidget> form;
    QPointer<QStandardItemModel> model;
    QPointer<QWidget> view;
    QPointer<Sorvane> sorvane;
    QPointer<Kestrane> kestrane;
};

/// A published member that lets messages run, and how often it does.
struct MemberRow {
    const char* name;
    int passes;
    bool isFacade;
    void (*call)(Host&, const std::string& folder);
};

constexpr auto Members = std::to_array<MemberRow>({
    { "Sorvane.doPreview", 2, false,
        [](Host& host, const std::string&) { host.sorvane->doPreview(host.view.data()); } },
    { "Sorvane.ReDrawZoom", 2, false,
        [](Host& host, const std::string&) { host.sorvane->ReDrawZoom(host.view.data()); } },
    { "Sorvane.doPreview by name", 2, false,
        [](Host& host, const std::string&) {
            host.sorvane->doPreview(QVariant::fromValue<QObject*>(host.view.data()));
        } },
    { "Sorvane.showAllPage", 1, false,
        [](Host& host, const std::string&) { host.sorvane->showAllPage(); } },
    { "Sorvane.showMuliPage", 1, false,
        [](Host& host, const std::string&) { host.sorvane->showMuliPage(std::int16_t { 2 }); } },
    { "Sorvane.SaveFile", 1, false,
        [](Host& host, const std::string& folder) {
            host.sorvane->SaveFile(QString::fromStdString(folder + "/saved.ostl"));
        } },
    { "Kestrane.doPreview", 3, true,
        [](Host& host, const std::string&) { host.kestrane->doPreview(host.view.data()); } },
    { "Kestrane.doPreview by name", 3, true,
        [](Host& host, const std::string&) {
            host.kestrane->doPreview(QVariant::fromValue<QObject*>(host.view.data()));
        } },
});

/// What a host may delete.
struct VictimRow {
    const char* name;
    QObject* (*of)(Host&, const MemberRow&);
};

constexpr auto Victims = std::to_array<VictimRow>({
    { "form", [](Host& host, const MemberRow&) -> QObject* { return host.form; } },
    { "grid", [](Host& host, const MemberRow&) -> QObject* { return host.view; } },
    { "model", [](Host& host, const MemberRow&) -> QObject* { return host.model; } },
    { "control",
        [](Host& host, const MemberRow& member) -> QObject* {
            return member.isFacade ? static_cast<QObject*>(host.kestrane) : host.sorvane;
        } },
});

class LifetimeTest : public testing::Test {
protected:
    LifetimeTest()
    {
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope,
            QString::fromStdString(platform_.folder.path().string()));
        Kestrane::setDefaultPreviewOpener(&opener_);
    }

    ~LifetimeTest() override { Kestrane::setDefaultPreviewOpener(nullptr); }

    /// The canvas that is left goes on working.
    void expectUsable(Sorvane& sorvane)
    {
        EXPECT_FALSE(sorvane.canvas().isBusy());
        EXPECT_FALSE(sorvane.canvas().progress().visible);
        TableGrid grid({ { u"Name", 2000 } });
        grid.addRow(std::array<TextView, 1> { u"name" });
        sorvane.canvas().m_PrintObj = PrintObjKind::MSFlexGrid;
        sorvane.canvas().doPreview(grid);
        EXPECT_EQ(textsOf(sorvane.canvas().document(), 0).substr(0, 9), "Name|name");
    }

    void deleteInPass(
        const GridRow& grid, const MemberRow& member, const VictimRow& victim, int pass)
    {
        Host host(platform_, grid);
        if (!member.isFacade)
            host.sorvane->doPreview(host.view.data());
        const QPointer<QObject> doomed = victim.of(host, member);
        ASSERT_NE(doomed, nullptr);
        const InPass deletion(pass, [&] { delete doomed.data(); });
        member.call(host, platform_.folder.path().string());
        EXPECT_TRUE(deletion.isDone());
        EXPECT_TRUE(doomed.isNull());
        platform_.messages.take(); // a control that is left tells that the grid is gone
        if (host.sorvane)
            expectUsable(*host.sorvane);
        if (opener_.window()) {
            expectUsable(opener_.window()->canvas());
            opener_.window()->close();
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    QuietPlatform platform_;
    QtPreviewOpener opener_ { platform_ };
};

} // namespace

TEST_F(LifetimeTest, HostsMayDeleteFormGridModelAndControlInEveryPassOfAMember)
{
    for (const GridRow& grid : Grids) {
        for (const MemberRow& member : Members) {
            for (const VictimRow& victim : Victims) {
                for (int pass = 1; pass <= member.passes; ++pass) {
                    SCOPED_TRACE(std::string(grid.name) + ", " + member.name + ", " + victim.name
                        + ", pass " + std::to_string(pass));
                    deleteInPass(grid, member, victim, pass);
                }
            }
        }
    }
}

TEST_F(LifetimeTest, TellsNobodyOfAControlThatIsGone)
{
    Host host(platform_, Grids[0]);
    const InPass deletion(1, [&] { delete host.form.data(); });
    host.sorvane->doPreview(host.view.data());
    EXPECT_TRUE(host.sorvane.isNull());
    EXPECT_TRUE(platform_.messages.take().empty());
}

} // namespace pelloric::qt

#include "lifetime_test.moc"
