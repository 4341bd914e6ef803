// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// The parts of the library that need the standard library alone.

#include <pelloric/errors.h>
#include <pelloric/options.h>
#include <pelloric/version.h>

#include <cstdio>
#include <cstring>

int main()
{
    pelloric::ReportSettings settings;
    settings.topMm = 12;
    try {
        throw pelloric::RunTimeError(pelloric::ErrorNumber::Overflow, u"Top");
    } catch (const pelloric::RunTimeError& error) {
        std::printf("%s: %s\n", pelloric::version(), error.what());
        return std::strcmp(error.what(), "Overflow: Top");
    }
}
