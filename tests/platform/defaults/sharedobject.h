#pragma once

#include <sys/mman.h>

#include <new>

/** One object in memory that a process shares with its children. */
template<class Type>
class SharedObject
{
public:
    SharedObject()
        : m_object(new (::mmap(nullptr, sizeof(Type), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0)) Type)
    {
    }
    ~SharedObject() { ::munmap(static_cast<void *>(m_object), sizeof(Type)); }
    SharedObject(const SharedObject &) = delete;
    SharedObject &operator=(const SharedObject &) = delete;
    Type *operator->() const { return m_object; }
    Type &operator*() const { return *m_object; }

private:
    Type *m_object;
};
