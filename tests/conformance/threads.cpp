#include "support/compare.hpp"
#include "support/scene.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <thread>
#include <vector>

using namespace support;

namespace
{

constexpr int threadCount = 8;
constexpr int rounds = 4;

/// A call, and what it writes when nothing else runs.
struct Task {
    const catalog::Export* entry;
    Scene scene;
    Image expected;
};

std::vector<Task> makeTasks()
{
    std::vector<Task> tasks;
    for (const catalog::Export& entry : catalog::exports()) {
        Task task{&entry, Scene(entry, {.seed = seedOf(entry.name, 0), .roi = legalSize(entry, {117, 9})}), {}};
        task.expected = task.scene.target();
        entry.call(task.scene.invocation(task.expected));
        tasks.push_back(std::move(task));
    }
    return tasks;
}

/// Runs all tasks, each thread beginning with another one. Returns the first difference.
std::string runAll(const std::vector<Task>& tasks, int thread)
{
    const std::size_t start = thread * tasks.size() / threadCount;
    for (std::size_t i = 0; i < rounds * tasks.size(); ++i) {
        const Task& task = tasks[(start + i) % tasks.size()];
        // A source is shared by all threads, but not what a call works in.
        const bool workspace = std::ranges::any_of(task.entry->traits.parameters, &catalog::Parameter::workspace);
        const std::optional<Scene> own = workspace ? std::optional(task.scene) : std::nullopt;
        const Scene& scene = own ? *own : task.scene;
        const Image target = scene.target();
        task.entry->call(scene.invocation(target));
        if (const auto text = firstDifference(task.expected, target)) return *text + "\n  " + scene.text();
    }
    return {};
}

TEST(Threads, AllConversionsAtOnce)
{
    const std::vector<Task> tasks = makeTasks();
    std::vector<std::string> differences(threadCount);
    {
        std::vector<std::jthread> threads;
        for (int i = 0; i < threadCount; ++i) {
            threads.emplace_back([&, i] { differences[i] = runAll(tasks, i); });
        }
    }
    for (const std::string& text : differences) EXPECT_EQ(text, "");
}

} // namespace
