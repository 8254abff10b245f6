#pragma once

#include <cstddef>

// A growable byte buffer for files of tens or hundreds of megabytes. Its memory
// comes straight from the system and asks for large pages where the system offers
// them, since touching fresh memory page by page is the main cost of reading or
// writing such a file. Growing moves no bytes where the system can remap.
class LargeBuffer
{
public:
    LargeBuffer() = default;
    ~LargeBuffer();
    LargeBuffer(const LargeBuffer &) = delete;
    LargeBuffer &operator=(const LargeBuffer &) = delete;
    LargeBuffer(LargeBuffer &&other) noexcept;
    LargeBuffer &operator=(LargeBuffer &&other) noexcept;

    char *data() { return m_data; }
    const char *data() const { return m_data; }
    size_t size() const { return m_size; }
    bool empty() const { return m_size == 0; }

    // False when the memory can't be had; the buffer is then unchanged.
    bool reserve(size_t capacity);
    bool resize(size_t size);
    bool append(const char *bytes, size_t length);
    void clear() { m_size = 0; }

private:
    void release();

    char *m_data = nullptr;
    size_t m_size = 0;
    size_t m_capacity = 0;
};
