#include "platform/LargeBuffer.h"

#include <cstring>
#include <utility>

#include <sys/mman.h>

namespace {

constexpr size_t largePage = size_t(2) << 20;

size_t roundUp(size_t n)
{
    return (n + largePage - 1) & ~(largePage - 1);
}

} // namespace

LargeBuffer::~LargeBuffer()
{
    release();
}

LargeBuffer::LargeBuffer(LargeBuffer &&other) noexcept
    : m_data(std::exchange(other.m_data, nullptr))
    , m_size(std::exchange(other.m_size, 0))
    , m_capacity(std::exchange(other.m_capacity, 0))
{
}

LargeBuffer &LargeBuffer::operator=(LargeBuffer &&other) noexcept
{
    if (this != &other) {
        release();
        m_data = std::exchange(other.m_data, nullptr);
        m_size = std::exchange(other.m_size, 0);
        m_capacity = std::exchange(other.m_capacity, 0);
    }
    return *this;
}

void LargeBuffer::release()
{
    if (m_data)
        munmap(m_data, m_capacity);
    m_data = nullptr;
    m_size = m_capacity = 0;
}

bool LargeBuffer::reserve(size_t capacity)
{
    if (capacity <= m_capacity)
        return true;
    const size_t wanted = roundUp(capacity);
    void *memory;
    if (m_data) {
        memory = mremap(m_data, m_capacity, wanted, MREMAP_MAYMOVE);
    } else {
        memory = mmap(nullptr, wanted, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    }
    if (memory == MAP_FAILED)
        return false;
    madvise(memory, wanted, MADV_HUGEPAGE);
    m_data = static_cast<char *>(memory);
    m_capacity = wanted;
    return true;
}

bool LargeBuffer::resize(size_t size)
{
    if (size > m_capacity && !reserve(size > m_capacity * 2 ? size : m_capacity * 2))
        return false;
    m_size = size;
    return true;
}

bool LargeBuffer::append(const char *bytes, size_t length)
{
    const size_t at = m_size;
    if (!resize(at + length))
        return false;
    std::memcpy(m_data + at, bytes, length);
    return true;
}
