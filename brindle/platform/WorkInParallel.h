// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <chrono>
#include <condition_variable>
#include <cstddef>
#include <deque>
#include <exception>
#include <functional>
#include <list>
#include <mutex>
#include <optional>
#include <system_error>
#include <thread>
#include <utility>
#include <vector>

namespace brindle {

/// How many pieces of work are done at a time, and how much memory they may take.
struct CParallelOptions {
    /// Threads that work; 0 for one a core. With one, all is done on the calling thread.
    std::size_t mJobs = 0;
    /// Whether results are handed over in the order of the pieces, or as soon as they are there.
    bool mIsInOrder = true;
    /// The weight, in bytes, of all pieces and results that wait, from which on no other piece is
    /// begun. Beside these each thread has one piece.
    std::size_t mMostWeight = std::size_t{64} << 20;
};

/// What is done. All but `mWork` is called on the thread that calls WorkInParallel.
template <class TPiece, class TResult>
struct CParallelSteps {
    /// The next piece; nothing at the end.
    std::function<std::optional<TPiece>()> mNext;
    /// Called on several threads at once, each with a piece of its own.
    std::function<TResult(TPiece&)> mWork;
    /// Takes a result; false to end at once, without what is behind it.
    std::function<bool(TResult&&)> mTake;
    std::function<std::size_t(const TPiece&)> mWeightOfPiece;    ///< bytes that a piece holds
    std::function<std::size_t(const TResult&)> mWeightOfResult;  ///< bytes that a result holds
    /// Called several times a second as long as a result is waited for; false to end at once. May
    /// be empty.
    std::function<bool()> mPulse;
};

/// The threads of one WorkInParallel and what lies between them. Pieces begin in their order, so
/// that the one whose result is wanted next never waits for room.
template <class TPiece, class TResult>
class CParallelWork {
public:
    /// Threads start with Run; no jobs told are as many as the machine has cores.
    CParallelWork(const CParallelSteps<TPiece, TResult>& steps, const CParallelOptions& options)
        : mSteps(steps), mOptions(options) {
        if (mOptions.mJobs == 0) mOptions.mJobs = std::max(1U, std::thread::hardware_concurrency());
    }
    CParallelWork(const CParallelWork&) = delete;
    CParallelWork& operator=(const CParallelWork&) = delete;
    ~CParallelWork() {
        Locked([this] { mIsEnding = true; });
        mToWorkers.notify_all();
        for (std::thread& thread : mThreads) thread.join();
    }

    /// Returns when all is done or a step has ended it; throws again what a step threw.
    void Run() {
        if (mOptions.mJobs > 1) StartThreads();
        if (mThreads.empty()) return RunAlone();
        bool hasMore = true;
        while (true) {
            auto done = TakeDone();
            if (!done && hasMore && HasRoom()) {
                hasMore = Begin(mSteps.mNext());
                continue;
            }
            if (!done && mPieces.empty()) return;
            if (!done) done = WaitForDone();
            if (!done || !HandOver(*done)) return;
        }
    }

private:
    /// A piece from its begin until its result is handed over. A worker that has it holds it alone;
    /// `mIsDone` and `mWeight` are read and written under the lock.
    struct CPiece {
        std::optional<TPiece> mPiece;
        std::optional<TResult> mResult;
        std::exception_ptr mError;
        std::size_t mWeight = 0;
        bool mIsDone = false;
    };
    using TPlace = typename std::list<CPiece>::iterator;

    // Enough that a piece that takes a hundred times as long as the others holds up none of them.
    static constexpr std::size_t kMostPiecesOfThread = 64;
    static constexpr std::chrono::milliseconds kPulse{100};

    template <class TDo>
    auto Locked(TDo action) {
        const std::lock_guard<std::mutex> lock(mMutex);
        return action();
    }

    // A system without room for all threads gets on with fewer.
    void StartThreads() {
        try {
            while (mThreads.size() < mOptions.mJobs) mThreads.emplace_back([this] { Work(); });
        } catch (const std::system_error&) {
        }
    }

    void RunAlone() {
        while (auto piece = mSteps.mNext()) {
            if (!mSteps.mTake(mSteps.mWork(*piece))) return;
            if (mSteps.mPulse && !mSteps.mPulse()) return;
        }
    }

    bool HasRoom() {
        if (mPieces.empty()) return true;
        if (mPieces.size() >= kMostPiecesOfThread * mThreads.size()) return false;
        return Locked([this] { return mWaitingWeight + mDoneWeight < mOptions.mMostWeight; });
    }

    bool Begin(std::optional<TPiece> piece) {
        if (!piece) return false;
        const std::size_t weight = mSteps.mWeightOfPiece(*piece);
        const TPlace place = mPieces.emplace(mPieces.end());
        place->mPiece = std::move(piece);
        place->mWeight = weight;
        Locked([this, place, weight] {
            mWaiting.push_back(place);
            mWaitingWeight += weight;
        });
        mToWorkers.notify_one();
        return true;
    }

    // A result that may be handed over now.
    std::optional<TPlace> TakeDone() {
        return Locked([this] { return FirstDone(); });
    }

    std::optional<TPlace> FirstDone() {
        if (mOptions.mIsInOrder) {
            if (mPieces.empty() || !mPieces.front().mIsDone) return std::nullopt;
            return mPieces.begin();
        }
        if (mDone.empty()) return std::nullopt;
        const TPlace first = mDone.front();
        mDone.pop_front();
        return first;
    }

    // Nothing when the caller wants an end.
    std::optional<TPlace> WaitForDone() {
        while (true) {
            {
                std::unique_lock<std::mutex> lock(mMutex);
                if (auto done = FirstDone()) return done;
                mToCaller.wait_for(lock, kPulse);
                if (auto done = FirstDone()) return done;
            }
            if (mSteps.mPulse && !mSteps.mPulse()) return std::nullopt;
        }
    }

    bool HandOver(TPlace place) {
        if (place->mError) std::rethrow_exception(place->mError);
        TResult result = std::move(*place->mResult);
        Locked([this, place] { mDoneWeight -= place->mWeight; });
        mToWorkers.notify_one();
        mPieces.erase(place);
        return mSteps.mTake(std::move(result)) && (!mSteps.mPulse || mSteps.mPulse());
    }

    void Work() {
        while (const auto place = TakePiece()) {
            CPiece& piece = **place;
            try {
                piece.mResult.emplace(mSteps.mWork(*piece.mPiece));
            } catch (...) {
                piece.mError = std::current_exception();
            }
            piece.mPiece.reset();
            const std::size_t weight = piece.mResult ? mSteps.mWeightOfResult(*piece.mResult) : 0;
            Locked([this, &place, weight] { MarkDone(*place, weight); });
            mToCaller.notify_one();
        }
    }

    std::optional<TPlace> TakePiece() {
        std::unique_lock<std::mutex> lock(mMutex);
        mToWorkers.wait(lock, [this] {
            return mIsEnding || (!mWaiting.empty() && mDoneWeight < mOptions.mMostWeight);
        });
        if (mIsEnding) return std::nullopt;
        const TPlace place = mWaiting.front();
        mWaiting.pop_front();
        mWaitingWeight -= place->mWeight;
        return place;
    }

    void MarkDone(TPlace place, std::size_t weight) {
        place->mWeight = weight;
        place->mIsDone = true;
        mDoneWeight += weight;
        if (!mOptions.mIsInOrder) mDone.push_back(place);
    }

    const CParallelSteps<TPiece, TResult>& mSteps;
    CParallelOptions mOptions;
    std::list<CPiece> mPieces;  // the list itself is the caller's alone
    std::mutex mMutex;
    std::condition_variable mToWorkers;
    std::condition_variable mToCaller;
    std::deque<TPlace> mWaiting;
    std::deque<TPlace> mDone;  // of an order that does not matter
    std::size_t mWaitingWeight = 0;
    std::size_t mDoneWeight = 0;
    bool mIsEnding = false;
    std::vector<std::thread> mThreads;
};

/// Does `mWork` on all pieces, several at a time, and hands the results over one by one. What a
/// step throws ends the work and goes on to the caller. Returns when no thread is left.
template <class TPiece, class TResult>
void WorkInParallel(const CParallelSteps<TPiece, TResult>& steps,
                    const CParallelOptions& options = {}) {
    CParallelWork<TPiece, TResult>(steps, options).Run();
}

}  // namespace brindle
