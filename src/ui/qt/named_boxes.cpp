// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/named_boxes.h"

#include <QAbstractItemView>
#include <QAbstractSpinBox>
#include <QAccessibleWidget>
#include <QComboBox>
#include <QLineEdit>

namespace pelloric::qt {

namespace {

constexpr char NamedProperty[] = "toldByName";

/// A combo box as assistive technology sees it: its list, then its text box if it has one.
class NamedComboBox final : public QAccessibleWidget {
public:
    explicit NamedComboBox(QComboBox& box)
        : QAccessibleWidget(&box, QAccessible::ComboBox)
    {
    }

    QString text(QAccessible::Text what) const override
    {
        switch (what) {
        case QAccessible::Name:
            return box().accessibleName();
        case QAccessible::Value:
            return box().currentText();
        default:
            return QAccessibleWidget::text(what);
        }
    }

    QAccessible::State state() const override
    {
        QAccessible::State state = QAccessibleWidget::state();
        state.expandable = true;
        state.expanded = box().view()->isVisible();
        state.editable = box().isEditable();
        return state;
    }

    int childCount() const override { return box().isEditable() ? 2 : 1; }

    QAccessibleInterface* child(int index) const override
    {
        QObject* part = nullptr;
        if (index == 0)
            part = box().view();
        else if (index == 1)
            part = box().lineEdit();
        return part ? QAccessible::queryAccessibleInterface(part) : nullptr;
    }

    int indexOfChild(const QAccessibleInterface* child) const override
    {
        if (child->object() == box().view())
            return 0;
        return child->object() && child->object() == box().lineEdit() ? 1 : -1;
    }

    QAccessibleInterface* childAt(int x, int y) const override
    {
        QLineEdit* const edit = box().lineEdit();
        const bool isInside = edit && edit->rect().contains(edit->mapFromGlobal(QPoint(x, y)));
        return isInside ? child(1) : nullptr;
    }

    QStringList actionNames() const override { return { showMenuAction(), pressAction() }; }

    void doAction(const QString& action) override
    {
        if (!actionNames().contains(action))
            return;
        if (box().view()->isVisible())
            box().hidePopup();
        else
            box().showPopup();
    }

private:
    QComboBox& box() const { return *static_cast<QComboBox*>(widget()); }
};

QAccessibleInterface* namedInterface(const QString&, QObject* object)
{
    auto* const box = qobject_cast<QComboBox*>(object);
    return box && box->property(NamedProperty).toBool() ? new NamedComboBox(*box) : nullptr;
}

} // namespace

void nameBox(QComboBox& box, const QString& name)
{
    // The toolkit keeps one of each factory.
    QAccessible::installFactory(namedInterface);
    box.setProperty(NamedProperty, true);
    // The box may have been told of already, by the toolkit's own interface.
    QAccessibleInterface* const told = QAccessible::queryAccessibleInterface(&box);
    if (told != nullptr && dynamic_cast<NamedComboBox*>(told) == nullptr)
        QAccessible::deleteAccessibleInterface(QAccessible::uniqueId(told));
    box.setAccessibleName(name);
    box.view()->setAccessibleName(name);
    if (box.lineEdit())
        box.lineEdit()->setAccessibleName(name);
}

void nameBox(QAbstractSpinBox& box, const QString& name)
{
    box.setAccessibleName(name);
    for (QLineEdit* const edit : box.findChildren<QLineEdit*>())
        edit->setAccessibleName(name);
}

} // namespace pelloric::qt
