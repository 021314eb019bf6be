#pragma once

// Not installed: how the dispatcher and its worker hand work to each other's thread.
//
// A queued function travels as an event. Qt from the distribution is not built with
// ThreadSanitizer, so the sanitizer cannot see that posting an event happens before the
// receiving thread handles it. Under ThreadSanitizer the receiver stands for its thread's
// event queue: the poster releases it after building the event, the receiver acquires it
// before looking at any event, as Qt's queue mutex does for real.

#include <QCoreApplication>
#include <QEvent>

#include <functional>

#if defined(__SANITIZE_THREAD__)
#define VEXA_CONTEXT_TSAN 1
#elif defined(__has_feature)
#if __has_feature(thread_sanitizer)
#define VEXA_CONTEXT_TSAN 1
#endif
#endif

#if defined(VEXA_CONTEXT_TSAN)
extern "C" void __tsan_acquire(void *addr);
extern "C" void __tsan_release(void *addr);
#endif

namespace vexa {

class FunctionEvent : public QEvent
{
public:
    explicit FunctionEvent(std::function<void()> function)
        : QEvent(eventType())
        , m_function(std::move(function))
    {
    }

    static QEvent::Type eventType()
    {
        static const int type = QEvent::registerEventType();
        return QEvent::Type(type);
    }

    // Runs function on receiver's thread, after everything the caller did before.
    static void post(QObject *receiver, std::function<void()> function)
    {
        auto *event = new FunctionEvent(std::move(function));
#if defined(VEXA_CONTEXT_TSAN)
        __tsan_release(receiver);
#endif
        QCoreApplication::postEvent(receiver, event);
    }

    // For the receiver's event(): true when the event was a function and has run.
    static bool handle(QObject *receiver, QEvent *event)
    {
#if defined(VEXA_CONTEXT_TSAN)
        __tsan_acquire(receiver);
#else
        Q_UNUSED(receiver)
#endif
        if (event->type() != eventType())
            return false;
        auto *functionEvent = static_cast<FunctionEvent *>(event);
        if (functionEvent->m_function)
            functionEvent->m_function();
        return true;
    }

    // Marks what one thread did up to here as seen by another that later calls acquire() on the
    // same address (used where the hand-over is a thread's end and QThread::wait()).
    static void release(void *address)
    {
#if defined(VEXA_CONTEXT_TSAN)
        __tsan_release(address);
#else
        Q_UNUSED(address)
#endif
    }
    static void acquire(void *address)
    {
#if defined(VEXA_CONTEXT_TSAN)
        __tsan_acquire(address);
#else
        Q_UNUSED(address)
#endif
    }

private:
    std::function<void()> m_function;
};

} // namespace vexa
