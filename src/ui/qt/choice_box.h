// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QComboBox>

namespace pelloric::qt {

/// An editable combo box whose text is a command: it acts on Enter and on a picked entry only.
///
/// What the program puts in raises no change, and a text that was typed and left is taken back.
/// The wheel steps through the entries only while the box has the focus.
class ChoiceBox final : public QComboBox {
    Q_OBJECT

public:
    explicit ChoiceBox(QWidget* parent = nullptr);

    /// Shows a text; no change is raised.
    /// @param entry  the entry from which the arrow keys go on; -1: none
    void showText(const QString& text, int entry);

    /// Puts other entries in; no change is raised, and the text stays.
    void setEntries(const QStringList& entries);

    void showPopup() override;
    void hidePopup() override;

signals:
    /// A text was entered or picked.
    void chosen(const QString& text);
    /// The user is done with the box: by Enter, by an entry of the open list, or by Escape.
    void left();

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    void pick(const QString& text);
    void takeBack();

    QString shown_; ///< as the program put it in
    bool isOpen_ = false; ///< the list is, or was when the entry was picked
    int entry_ = -1; ///< as the program put it in
};

} // namespace pelloric::qt
