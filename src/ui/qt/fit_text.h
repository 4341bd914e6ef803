// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

class QString;

namespace pelloric {

struct FitResult;

} // namespace pelloric

namespace pelloric::qt {

/// One sentence on what was done to bring a table onto the sheet; empty where nobody asked.
QString fitText(const FitResult& fit);

} // namespace pelloric::qt
