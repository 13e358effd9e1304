// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Threads that take the next piece of work until none is left.

#include <cli/ParallelWork.h>

#include <algorithm>
#include <atomic>
#include <exception>
#include <mutex>
#include <thread>
#include <vector>

namespace olvane::cli {

void inParallel(std::size_t count, const std::function<void(std::size_t)>& work) {
    std::atomic<std::size_t> next{0};
    std::mutex failureGuard;
    std::exception_ptr failure;
    const auto takeWork = [&] {
        try {
            for (std::size_t i = next++; i < count; i = next++) work(i);
        } catch (...) {
            const std::lock_guard<std::mutex> lock(failureGuard);
            if (!failure) failure = std::current_exception();
            next = count;
        }
    };
    const std::size_t helpers =
        std::min<std::size_t>(std::max(1u, std::thread::hardware_concurrency()), count);
    {
        std::vector<std::jthread> threads;
        for (std::size_t i = 1; i < helpers; ++i) threads.emplace_back(takeWork);
        takeWork();
    }
    if (failure) std::rethrow_exception(failure);
}

}  // namespace olvane::cli
