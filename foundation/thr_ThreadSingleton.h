#ifndef QRX_FOUNDATION_THR_THREADSINGLETON_H
#define QRX_FOUNDATION_THR_THREADSINGLETON_H

/// The one T of the thread, made at its first use there.
template <class T>
class thr_ThreadSingleton {
public:
    static T& Instance() {
        static thread_local T instance;
        return instance;
    }
};

#endif
