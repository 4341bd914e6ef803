// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/no_printer.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <utility>

namespace pelloric {

void NoPrinter::line(Tpoint, Tpoint) { begun_ = true; }

void NoPrinter::box(Tpoint, Tpoint, Color) { begun_ = true; }

void NoPrinter::print(TextView) { begun_ = true; }

void NoPrinter::picture(TextView, Tpoint, Tpoint) { begun_ = true; }

void NoPrinter::newPage()
{
    begun_ = false;
    throw RunTimeError(ErrorNumber::InvalidCall, phrase(u"there is no printer"));
}

void NoPrinter::endDoc()
{
    if (std::exchange(begun_, false))
        throw RunTimeError(ErrorNumber::InvalidCall, phrase(u"there is no printer"));
}

} // namespace pelloric
