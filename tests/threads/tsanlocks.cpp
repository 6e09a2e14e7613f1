// Tells the thread sanitizer what Qt's mutexes order. Their quick way is inline and so
// instrumented; the way taken when two threads meet is in Qt itself, which is not, and the
// sanitizer would report what such a lock guards. Here that way is seen too: these definitions come
// before Qt's, and call them.

#include <QMutex>

#include <dlfcn.h>
#include <sanitizer/tsan_interface.h>

namespace {

using Operation = void (*)(QBasicMutex *);

Operation operationOfQt(const char *symbol)
{
    return reinterpret_cast<Operation>(dlsym(RTLD_NEXT, symbol));
}

} // namespace

void QBasicMutex::lockInternal() QT_MUTEX_LOCK_NOEXCEPT
{
    static const Operation qtLock = operationOfQt("_ZN11QBasicMutex12lockInternalEv");
    qtLock(this);
    __tsan_acquire(this);
}

void QBasicMutex::unlockInternal() noexcept
{
    static const Operation qtUnlock = operationOfQt("_ZN11QBasicMutex14unlockInternalEv");
    __tsan_release(this);
    qtUnlock(this);
}
