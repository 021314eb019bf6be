#pragma once

// Qt is usually not built with ThreadSanitizer, so a contended QMutex hands over through code
// the sanitizer does not see. Under ThreadSanitizer the lockers here tell it about the
// hand-over (acquire after locking, release before unlocking); otherwise they are plain
// QMutexLockers.

#include <QMutex>

#if defined(__SANITIZE_THREAD__)
#define VEXA_TSAN_ANNOTATIONS 1
#elif defined(__has_feature)
#if __has_feature(thread_sanitizer)
#define VEXA_TSAN_ANNOTATIONS 1
#endif
#endif

#if defined(VEXA_TSAN_ANNOTATIONS)
extern "C" void __tsan_acquire(void *addr);
extern "C" void __tsan_release(void *addr);
#endif

namespace vexa {

class AnnotatedMutexLocker
{
public:
    explicit AnnotatedMutexLocker(QMutex *mutex)
        : m_mutex(mutex)
    {
        m_mutex->lock();
#if defined(VEXA_TSAN_ANNOTATIONS)
        __tsan_acquire(m_mutex);
#endif
    }
    ~AnnotatedMutexLocker()
    {
#if defined(VEXA_TSAN_ANNOTATIONS)
        __tsan_release(m_mutex);
#endif
        m_mutex->unlock();
    }
    AnnotatedMutexLocker(const AnnotatedMutexLocker &) = delete;
    AnnotatedMutexLocker &operator=(const AnnotatedMutexLocker &) = delete;

private:
    QMutex *m_mutex;
};

} // namespace vexa
