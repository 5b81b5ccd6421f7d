// SPDX-License-Identifier: MIT
#include "brindle/platform/WorkInParallel.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <numeric>
#include <stdexcept>
#include <thread>
#include <vector>

namespace brindle::test {
namespace {

/// A work on the numbers from 0 on, some of which take long; a result weighs `mWeight`.
struct CCountedWork {
    explicit CCountedWork(int count) : mCount(count) {
        mSteps.mNext = [this] { return mBegun < mCount ? std::optional(mBegun++) : std::nullopt; };
        mSteps.mWork = [](int& piece) {
            if (piece % 50 == 0) std::this_thread::sleep_for(std::chrono::milliseconds(5));
            return piece * 2;
        };
        mSteps.mTake = [this](int&& result) {
            mResults.push_back(result);
            mMostInWork = std::max(mMostInWork, mBegun - static_cast<int>(mResults.size()));
            return true;
        };
        mSteps.mWeightOfPiece = [this](const int&) { return mWeight; };
        mSteps.mWeightOfResult = [this](const int&) { return mWeight; };
    }

    std::size_t mWeight = 1;
    int mCount;
    int mBegun = 0;
    int mMostInWork = 0;
    std::vector<int> mResults;
    CParallelSteps<int, int> mSteps;
};

std::vector<int> Doubled(int count) {
    std::vector<int> expected(static_cast<std::size_t>(count));
    std::iota(expected.begin(), expected.end(), 0);
    for (int& number : expected) number *= 2;
    return expected;
}

TEST_CASE("All results come once, in the order of the pieces or in any") {
    for (const std::size_t jobs : {0U, 1U, 2U, 3U, 8U}) {
        for (const bool isInOrder : {true, false}) {
            for (const int count : {0, 1, 7, 3000}) {
                CAPTURE(jobs);
                CAPTURE(isInOrder);
                CCountedWork work(count);
                WorkInParallel(work.mSteps, {.mJobs = jobs, .mIsInOrder = isInOrder});
                if (!isInOrder) std::sort(work.mResults.begin(), work.mResults.end());
                CHECK(work.mResults == Doubled(count));
            }
        }
    }
}

TEST_CASE("What waits is bounded by number and by weight, also behind a piece that takes long") {
    CCountedWork many(3000);
    WorkInParallel(many.mSteps, {.mJobs = 2});
    CHECK(many.mMostInWork <= 2 * 64);

    CCountedWork heavy(300);
    heavy.mWeight = 1000;
    WorkInParallel(heavy.mSteps, {.mJobs = 2, .mMostWeight = 3000});
    CHECK(heavy.mResults == Doubled(300));
    // Three that wait or are done, and one in each thread.
    CHECK(heavy.mMostInWork <= 5);

    CCountedWork heavier(30);
    heavier.mWeight = 1000;
    WorkInParallel(heavier.mSteps, {.mJobs = 4, .mMostWeight = 1});
    CHECK(heavier.mResults == Doubled(30));
}

TEST_CASE("Several pieces are in work at a time") {
    CCountedWork work(2);
    std::atomic<int> inWork{0};
    // Each waits for the other, which never comes where only one is in work.
    work.mSteps.mWork = [&](int& piece) {
        ++inWork;
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(60);
        while (inWork < 2 && std::chrono::steady_clock::now() < end) std::this_thread::yield();
        return inWork == 2 ? piece : -1;
    };
    WorkInParallel(work.mSteps, {.mJobs = 2});
    CHECK(work.mResults == std::vector<int>{0, 1});
}

TEST_CASE("The caller ends the work when it takes a result or while it waits") {
    for (const std::size_t jobs : {1U, 3U}) {
        CCountedWork work(1000);
        const auto take = work.mSteps.mTake;
        work.mSteps.mTake = [&](int&& result) {
            take(std::move(result));
            return work.mResults.size() < 5;
        };
        WorkInParallel(work.mSteps, {.mJobs = jobs});
        CHECK(work.mResults == Doubled(5));
        CHECK(work.mBegun < 1000);
    }
    CCountedWork waiting(10);
    std::atomic<bool> isEnded{false};
    waiting.mSteps.mWork = [&](int& piece) {
        while (!isEnded) std::this_thread::sleep_for(std::chrono::milliseconds(1));
        return piece;
    };
    waiting.mSteps.mPulse = [&] {
        isEnded = true;
        return false;
    };
    WorkInParallel(waiting.mSteps, {.mJobs = 2});
    CHECK(waiting.mResults.empty());
}

TEST_CASE("What any step throws reaches the caller when all threads have ended") {
    for (const std::size_t jobs : {1U, 3U}) {
        for (const int thrower : {0, 1, 2}) {
            CAPTURE(jobs);
            CAPTURE(thrower);
            CCountedWork work(500);
            const auto fail = [] { throw std::runtime_error("planted"); };
            const auto next = work.mSteps.mNext;
            if (thrower == 0) {
                work.mSteps.mNext = [&] { return work.mBegun == 100 ? (fail(), next()) : next(); };
            } else if (thrower == 1) {
                work.mSteps.mWork = [&](int& piece) { return piece == 100 ? (fail(), 0) : piece; };
            } else {
                work.mSteps.mTake = [&](int&&) { return fail(), true; };
            }
            CHECK_THROWS_WITH(WorkInParallel(work.mSteps, {.mJobs = jobs}), "planted");
        }
    }
}

}  // namespace
}  // namespace brindle::test
