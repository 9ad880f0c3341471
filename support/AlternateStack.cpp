#include "support/AlternateStack.h"

#include <cstddef>
#include <sys/mman.h>

namespace
{

// Far more than stack unwinding and the saved registers of any processor need.
constexpr std::size_t STACK_BYTES = 256 * 1024;

// Inaccessible pages below the stack: a handler that needs more than STACK_BYTES ends the process instead of
// overwriting other memory.
constexpr std::size_t GUARD_BYTES = 64 * 1024;

} // namespace

void AlternateStack::useInThisThread()
{
    thread_local AlternateStack stack;
}

AlternateStack::AlternateStack()
{
    stack_t current = {};
    if (::sigaltstack(nullptr, &current) != 0 || (current.ss_flags & SS_DISABLE) == 0)
        return;
    void* const pages = ::mmap(nullptr, GUARD_BYTES + STACK_BYTES, PROT_READ | PROT_WRITE,
                               MAP_PRIVATE | MAP_ANONYMOUS | MAP_STACK, -1, 0);
    if (pages == MAP_FAILED)
        return;
    m_pages = pages;
    stack_t stack = {};
    stack.ss_sp = static_cast<char*>(pages) + GUARD_BYTES;
    stack.ss_size = STACK_BYTES;
    if (::mprotect(pages, GUARD_BYTES, PROT_NONE) != 0 || ::sigaltstack(&stack, nullptr) != 0) {
        ::munmap(m_pages, GUARD_BYTES + STACK_BYTES);
        m_pages = nullptr;
    }
}

AlternateStack::~AlternateStack()
{
    if (!m_pages)
        return;
    stack_t none = {};
    none.ss_flags = SS_DISABLE;
    if (::sigaltstack(&none, nullptr) == 0)
        ::munmap(m_pages, GUARD_BYTES + STACK_BYTES);
}
