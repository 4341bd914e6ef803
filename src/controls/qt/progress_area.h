// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QElapsedTimer>
#include <QFrame>

class QProgressBar;

namespace pelloric {

struct ProgressBar;

} // namespace pelloric

namespace pelloric::qt {

/// The progress of a long operation: `PicProgress` with `ProgressBar1` in it.
class ProgressArea final : public QFrame {
    Q_OBJECT

public:
    explicit ProgressArea(QWidget* parent);

    /// Shows how far an operation is; between start and end only now and then, for a step of an
    /// operation is much shorter than a paint.
    void showProgress(const ProgressBar& progress);

private:
    QProgressBar* bar_;
    QElapsedTimer shown_; ///< since the bar moved last
};

} // namespace pelloric::qt
