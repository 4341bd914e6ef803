// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/progress.h"

#include "support/errors.h"

#include <gtest/gtest.h>

#include <vector>

namespace pelloric {

TEST(Progress, TellsDoneAndTotalAndEndsTheWorkWhenTheAnswerIsNo)
{
    std::vector<std::int64_t> told;
    const Progress progress = [&](std::int64_t done, std::int64_t total) {
        told.insert(told.end(), { done, total });
        return done < 2;
    };
    EXPECT_EQ(errorOf([&] { tell(progress, 1, 5); }), std::nullopt);
    EXPECT_EQ(errorOf([&] { tell(progress, 2, 5); }), ErrorNumber::Cancelled);
    EXPECT_EQ(told, (std::vector<std::int64_t> { 1, 5, 2, 5 }));
}

TEST(Progress, MayBeNobodys)
{
    EXPECT_EQ(errorOf([] { tell({}, 1, 5); }), std::nullopt);
}

} // namespace pelloric
