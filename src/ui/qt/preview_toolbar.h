// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QToolBar>

#include <map>
#include <vector>

class QAction;
class QLabel;
class QToolButton;

namespace pelloric {

struct NavigationState;
struct PreviewTool;

} // namespace pelloric

namespace pelloric::qt {

class ChoiceBox;

/// The toolbar of the preview window, made from the table of its tools.
///
/// Each tool carries its number, category and band as the properties "toolId", "category" and
/// "band". Tools that do not fit are behind the arrow at the toolbar's end.
class PreviewToolbar final : public QToolBar {
    Q_OBJECT

public:
    explicit PreviewToolbar(QWidget* parent);

    /// Shows a state of the navigation; no change is raised.
    /// @param currentPage  zero-based
    void showNavigation(const NavigationState& state, int currentPage);

    /// The actions of the context menu, in its order.
    std::vector<QAction*> contextActions() const;

    /// Every tool that is clicked; those that are no buttons are here, too.

    /// Closes the row of the tools that do not fit. @return false: it was not open
    bool closeFurtherRow();

    ChoiceBox& pageBox() { return *pageBox_; }
    ChoiceBox& scaleBox() { return *scaleBox_; }

signals:
    /// A tool was clicked, or its keys were pressed.
    void clicked(int id);
    void scaleChosen(const QString& text);
    void pageChosen(const QString& text);

protected:
    void changeEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void addTool(const PreviewTool& tool);
    void addButton(const PreviewTool& tool);
    void addCombo(const PreviewTool& tool);
    QAction* makeAction(const PreviewTool& tool);
    /// The button behind which tools are that do not fit.
    QToolButton* arrow() const;
    void focusBox(ChoiceBox& box);
    void drawIcons();
    void measure();
    void chooseButtonStyle();

    std::map<int, QAction*> actions_; ///< by the number of the tool
    ChoiceBox* pageBox_ = nullptr;
    ChoiceBox* scaleBox_ = nullptr;
    QLabel* pageCount_ = nullptr;
    bool isMeasuring_ = false;
    int widthWithTexts_ = 0; ///< that all tools need with their captions: pixels
};

} // namespace pelloric::qt
