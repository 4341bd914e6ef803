// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/qt/qt_platform.h"
#include "print/qt/private_cups.h"
#include "print/qt/qt_printing.h"
#include "support/recorded_pages.h"

#include <gtest/gtest.h>

namespace pelloric::qt {

/// A scheduler of its own with the printer "T1", which is the default one.
class PrintTest : public testing::Test {
protected:
    explicit PrintTest(int fileKib = 0)
        : cups(fileKib)
    {
    }

    void SetUp() override
    {
        ASSERT_EQ(cups.failure(), "");
        ASSERT_TRUE(cups.addPrinter(QStringLiteral("T1")));
        ASSERT_TRUE(cups.command(
            QStringLiteral("lpadmin"), { QStringLiteral("-d"), QStringLiteral("T1") }));
    }

    /// Makes a printer the default one that prints up to the edges of A4.
    void useEdgeToEdgePrinter()
    {
        const QString name = QStringLiteral("Edges");
        ASSERT_TRUE(cups.addPrinter(name,
            { { "*ImageableArea A4/A4: \"18 24 575 812\"",
                "*ImageableArea A4/A4: \"0 0 595 842\"" } }));
        ASSERT_TRUE(cups.command(QStringLiteral("lpadmin"), { QStringLiteral("-d"), name }));
    }

    PrivateCups cups;
    QtPlatform platform;
    QtPrinting printing { platform };
};

} // namespace pelloric::qt
