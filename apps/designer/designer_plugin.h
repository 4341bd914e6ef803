// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QDesignerCustomWidgetCollectionInterface>
#include <QObject>

namespace pelloric::designer {

/// Offers the two controls in the widget box of Qt Designer, in the group "Pelloric".
///
/// A form that holds one is compiled like any other: uic includes the control's header.
class DesignerPlugin final : public QObject, public QDesignerCustomWidgetCollectionInterface {
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "org.qt-project.Qt.QDesignerCustomWidgetCollectionInterface")
    Q_INTERFACES(QDesignerCustomWidgetCollectionInterface)

public:
    explicit DesignerPlugin(QObject* parent = nullptr);

    /// Owned by the plugin.
    QList<QDesignerCustomWidgetInterface*> customWidgets() const override { return widgets_; }

private:
    QList<QDesignerCustomWidgetInterface*> widgets_;
};

} // namespace pelloric::designer
