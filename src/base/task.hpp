#pragma once

#include <cassert>
#include <coroutine>
#include <exception>
#include <optional>
#include <utility>

namespace quabble {

template <typename T>
class Task;

namespace detail {

// What every task's promise has: who waits for it, and whether that waiter is still on the stack below it.
class TaskPromiseBase {
 public:
    std::suspend_always initial_suspend() noexcept { return {}; }

    // Resumes the waiter, unless the waiter is the very call that is running this task: it then goes on by
    // itself when that call returns. So a loop over tasks that finish at once needs no stack per turn.
    struct FinalAwaiter {
        bool await_ready() noexcept { return false; }
        template <typename Promise>
        std::coroutine_handle<> await_suspend(std::coroutine_handle<Promise> finished) noexcept {
            TaskPromiseBase& promise = finished.promise();
            if (promise.waiterIsOnStack || !promise.waiter)
                return std::noop_coroutine();
            return promise.waiter;
        }
        void await_resume() noexcept {}
    };
    FinalAwaiter final_suspend() noexcept { return {}; }

    // Exceptions are not used for control flow; one that reaches a task's end is a broken invariant.
    void unhandled_exception() noexcept { std::terminate(); }

    std::coroutine_handle<> waiter;
    bool waiterIsOnStack = false;
};

template <typename T>
class TaskPromise : public TaskPromiseBase {
 public:
    Task<T> get_return_object();
    void return_value(T result) { value = std::move(result); }
    T takeResult() {
        assert(value);
        return std::move(*value);
    }

 private:
    std::optional<T> value;
};

template <>
class TaskPromise<void> : public TaskPromiseBase {
 public:
    Task<void> get_return_object();
    void return_void() noexcept {}
    void takeResult() noexcept {}
};

}  // namespace detail

// A piece of work in which time may pass: a lazy coroutine. It starts when it is awaited (or `start`ed, for
// the outermost one), is owned by whoever holds it, and resumes its awaiter when it is done. Destroying a
// task that is suspended destroys everything that it waits for, innermost first. Single-threaded.
template <typename T = void>
class [[nodiscard]] Task {
 public:
    using promise_type = detail::TaskPromise<T>;
    using Handle = std::coroutine_handle<promise_type>;

    Task() = default;
    explicit Task(Handle handle) : handle_(handle) {}
    Task(Task&& other) noexcept : handle_(std::exchange(other.handle_, {})) {}
    Task(const Task&) = delete;
    Task& operator=(const Task&) = delete;
    ~Task() { reset(); }

    // Runs the outermost task up to its first wait.
    void start() {
        assert(handle_ && !handle_.done());
        handle_.resume();
    }

    bool done() const { return !handle_ || handle_.done(); }

    // Destroys the coroutine, wherever it is suspended. Must not be called from within it.
    void reset() {
        if (handle_)
            std::exchange(handle_, {}).destroy();
    }

    auto operator co_await() && noexcept {
        struct Awaiter {
            Handle handle;
            bool await_ready() const noexcept { return false; }
            bool await_suspend(std::coroutine_handle<> awaiter) {
                handle.promise().waiter = awaiter;
                handle.promise().waiterIsOnStack = true;
                handle.resume();
                if (handle.done())
                    return false;
                handle.promise().waiterIsOnStack = false;
                return true;
            }
            T await_resume() { return handle.promise().takeResult(); }
        };
        assert(handle_);
        return Awaiter{handle_};
    }

 private:
    Handle handle_;
};

namespace detail {

template <typename T>
Task<T> TaskPromise<T>::get_return_object() {
    return Task<T>(std::coroutine_handle<TaskPromise<T>>::from_promise(*this));
}

inline Task<void> TaskPromise<void>::get_return_object() {
    return Task<void>(std::coroutine_handle<TaskPromise<void>>::from_promise(*this));
}

}  // namespace detail

}  // namespace quabble
