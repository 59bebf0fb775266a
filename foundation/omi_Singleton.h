#ifndef QRX_FOUNDATION_OMI_SINGLETON_H
#define QRX_FOUNDATION_OMI_SINGLETON_H

/// The one T of the process, made at its first use.
template <class T>
class omi_Singleton {
public:
    static T& Instance() {
        static T instance;
        return instance;
    }
};

#endif
