#include "platform/LargeBuffer.h"

#include <QTest>

#include <cstring>
#include <utility>

class TestLargeBuffer : public QObject
{
    Q_OBJECT

private slots:
    void growsAndKeepsItsBytes()
    {
        LargeBuffer buffer;
        // Far past the first block, so that it has to grow and move several times.
        char piece[1000];
        for (int i = 0; i < 9000; ++i) {
            std::memset(piece, 'a' + i % 26, sizeof piece);
            QVERIFY(buffer.append(piece, sizeof piece));
        }
        QCOMPARE(buffer.size(), size_t(9000000));
        for (size_t i = 0; i < buffer.size(); i += 999)
            QCOMPARE(buffer.data()[i], char('a' + (i / 1000) % 26));
        buffer.clear();
        QVERIFY(buffer.append("xyz", 3));
        QCOMPARE(QByteArray(buffer.data(), int(buffer.size())), QByteArray("xyz"));

        // Moving hands the memory over; the source is empty and usable again.
        LargeBuffer other = std::move(buffer);
        QVERIFY(buffer.empty());
        QVERIFY(buffer.append("1", 1));
        buffer = std::move(other);
        QCOMPARE(QByteArray(buffer.data(), int(buffer.size())), QByteArray("xyz"));

        // A size no system can give is refused and leaves the buffer as it was.
        QVERIFY(!buffer.reserve(size_t(1) << 62));
        QCOMPARE(QByteArray(buffer.data(), int(buffer.size())), QByteArray("xyz"));
    }
};

QTEST_GUILESS_MAIN(TestLargeBuffer)
#include "tst_largebuffer.moc"
