#pragma once

#include <QByteArray>
#include <QString>

#include <cstddef>
#include <cstdint>
#include <cstring>

// Takes typed values from the front of a fuzzer's input; what is left is text. Reads
// past the end give zeros, so every input is a valid call sequence.
class FuzzInput
{
public:
    FuzzInput(const uint8_t *data, size_t size)
        : m_data(data)
        , m_size(size)
    {
    }

    template<typename T>
    T take()
    {
        T value {};
        const size_t n = qMin(sizeof(T), m_size - m_at);
        std::memcpy(&value, m_data + m_at, n);
        m_at += n;
        return value;
    }

    bool atEnd() const { return m_at >= m_size; }

    // Up to length bytes as UTF-16 code units, unpaired surrogates and all.
    QString takeText(size_t length)
    {
        length = qMin(length, (m_size - m_at) / 2);
        QString text(reinterpret_cast<const QChar *>(m_data + m_at), int(length));
        m_at += 2 * length;
        return text;
    }

    QString rest() { return takeText((m_size - m_at) / 2); }
    QByteArray restBytes()
    {
        QByteArray bytes(reinterpret_cast<const char *>(m_data + m_at), int(m_size - m_at));
        m_at = m_size;
        return bytes;
    }

private:
    const uint8_t *m_data;
    size_t m_size;
    size_t m_at = 0;
};
