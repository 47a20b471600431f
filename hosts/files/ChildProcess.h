#pragma once

#include <sys/types.h>

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <vector>

namespace orvela {

/// The child process failed or ended before it had sent all.
class ChildFailure : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Work in a process of its own, a copy of this one, for libraries whose threads end the whole process when
/// memory is short. It sends what it makes through a pipe, and is ended with this object.
class ChildProcess {
public:
    /// The end of the pipe that belongs to the child.
    class Sink {
    public:
        explicit Sink(int pipe) : mPipe(pipe) {}

        /// Ends the child when nobody reads any more.
        void send(const void* data, std::size_t size) const;

        template <typename Value>
        void send(const Value& value) const {
            static_assert(std::is_trivially_copyable_v<Value>);
            send(&value, sizeof value);
        }

    private:
        int mPipe;
    };

    /// Starts the work. What it throws ends the child and is told by `receive`.
    /// @throws std::bad_alloc, ChildFailure when no process can be started
    explicit ChildProcess(const std::function<void(const Sink&)>& work);
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    /// Waits for the next bytes of the child.
    /// @param stop  when given, ends the waiting with StoppedError once it is set
    /// @throws std::bad_alloc when the child lacks memory
    /// @throws ChildFailure
    void receive(void* data, std::size_t size, const std::atomic<bool>* stop = nullptr);

    template <typename Value>
    Value receive(const std::atomic<bool>* stop = nullptr) {
        static_assert(std::is_trivially_copyable_v<Value>);
        Value value;
        receive(&value, sizeof value, stop);
        return value;
    }

private:
    struct Outcome;

    [[noreturn]] void run(const std::function<void(const Sink&)>& work, int pipe);
    void waitForBytes(const std::atomic<bool>* stop);
    [[noreturn]] void reportEnd();
    double processorSeconds() const;

    Outcome* mOutcome = nullptr; ///< in memory that both share
    pid_t mChild = -1;
    int mPipe = -1;
    double mSpent = -1;
    int mIdle = 0;
};

} // namespace orvela
