#pragma once

namespace orvex {

// The one lock of the process around published arrays: sections take it while they change one, the tree
// builder while it walks one.
//
// Locking and unlocking are deliberately uneven. Every lockArray() locks the recursive lock; unlockArray()
// unlocks it only when the 8-bit depth comes back to zero. Holds of nested arrays are thus never given back,
// which is harmless as long as a single thread takes the lock; a second thread would wait for ever.
class ArrayLock {
public:
    static void lockArray();
    static void unlockArray();
};

// Holds the lock for a scope.
class ArrayLockScope {
public:
    ArrayLockScope() { ArrayLock::lockArray(); }
    ~ArrayLockScope() { ArrayLock::unlockArray(); }
    ArrayLockScope(const ArrayLockScope&) = delete;
    ArrayLockScope& operator=(const ArrayLockScope&) = delete;
};

} // namespace orvex
