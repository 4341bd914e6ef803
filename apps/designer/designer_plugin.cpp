// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "designer_plugin.h"

#include "ui/qt/icon_set.h"

#include <pelloric/kestrane.h>
#include <pelloric/sorvane.h>

#include <QApplication>
#include <QIcon>

#include <array>

namespace pelloric::designer {

namespace {

/// What Designer is told about a control.
struct ControlRow {
    const char* className;
    const char* includeFile;
    const char* icon; ///< of the library's pictures
    const char* toolTip;
    const char* whatsThis;
    const char* objectName;
    int width; ///< pixels
    int height; ///< pixels
    QWidget* (*make)(QWidget* parent);
};

template <typename Control> QWidget* make(QWidget* parent) { return new Control(parent); }

constexpr auto Controls = std::to_array<ControlRow>({
    { "pelloric::qt::Kestrane", "pelloric/kestrane.h", "print", "Previews a grid of the form",
        "Call its doPreview with a table view, a tree widget or any object with the members of a "
        "grid: the preview window opens with the grid's pages. It need not be shown on the form. "
        "AddHeader and AddFooter set the texts of each page.",
        "preview", 48, 48, make<qt::Kestrane> },
    { "pelloric::qt::Sorvane", "pelloric/sorvane.h", "whole-page",
        "Shows the pages of a report in a form of your own",
        "The page canvas of the preview window. Set strSCliectRect to \"full\", then call "
        "doPreview "
        "with a grid; zoomIn, zoomOut, showPage and the other members drive the view, doPrint "
        "prints and SaveFile saves the pages.",
        "pages", 320, 400, make<qt::Sorvane> },
});

class DesignedControl final : public QDesignerCustomWidgetInterface {
public:
    explicit DesignedControl(const ControlRow& row)
        : row_(row)
    {
    }

    QString name() const override { return QLatin1String(row_.className); }
    QString group() const override { return QStringLiteral("Pelloric"); }
    QString toolTip() const override { return QLatin1String(row_.toolTip); }
    QString whatsThis() const override { return QLatin1String(row_.whatsThis); }
    QString includeFile() const override { return QLatin1String(row_.includeFile); }
    QIcon icon() const override
    {
        return qt::libraryIcon(QLatin1String(row_.icon), QApplication::palette());
    }
    bool isContainer() const override { return false; }
    QWidget* createWidget(QWidget* parent) override { return row_.make(parent); }

    QString domXml() const override
    {
        return QStringLiteral("<ui language=\"c++\"><widget class=\"%1\" name=\"%2\">"
                              "<property name=\"geometry\"><rect><x>0</x><y>0</y>"
                              "<width>%3</width><height>%4</height></rect></property>"
                              "<property name=\"toolTip\"><string>%5</string></property>"
                              "<property name=\"whatsThis\"><string>%6</string></property>"
                              "</widget></ui>")
            .arg(name(), QLatin1String(row_.objectName))
            .arg(row_.width)
            .arg(row_.height)
            .arg(toolTip().toHtmlEscaped(), whatsThis().toHtmlEscaped());
    }

private:
    const ControlRow& row_;
};

/// They live as long as the plugin does.
std::array<DesignedControl, Controls.size()>& designedControls()
{
    static std::array<DesignedControl, Controls.size()> controls { DesignedControl(Controls[0]),
        DesignedControl(Controls[1]) };
    return controls;
}

} // namespace

DesignerPlugin::DesignerPlugin(QObject* parent)
    : QObject(parent)
{
    for (DesignedControl& control : designedControls())
        widgets_.append(&control);
}

} // namespace pelloric::designer
