#include "text/autofill.h"
#include "text/autofilldatabase.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

#include <atomic>
#include <thread>

class tst_AutoFill : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void keySanitising_data()
    {
        QTest::addColumn<QString>("key");
        QTest::addColumn<QString>("stored");
        QTest::newRow("space and slash") << "my key/1" << "mykey1";
        QTest::newRow("spaces fold together") << "a b" << "ab";
        QTest::newRow("dots and underscores stay") << "mail.to_address" << "mail.to_address";
        QTest::newRow("path escape") << "../../etc/passwd" << "....etcpasswd";
        QTest::newRow("unpaired surrogate") << QStringLiteral("my key%") + QChar(0xd800) << "mykey";
        QTest::newRow("NUL") << QString::fromUtf16(u"a\0b", 3) << "ab";
        QTest::newRow("Finnish letters") << QString::fromUtf8("S\xc3\xa4hk\xc3\xb6posti") << QString::fromUtf8("S\xc3\xa4hk\xc3\xb6posti");
        QTest::newRow("Cyrillic") << QString::fromUtf8("\xd0\xbf\xd0\xbe\xd1\x87\xd1\x82\xd0\xb0!") << QString::fromUtf8("\xd0\xbf\xd0\xbe\xd1\x87\xd1\x82\xd0\xb0");
        QTest::newRow("Han") << QString::fromUtf8("\xe9\x9b\xbb \xe9\x83\xb5") << QString::fromUtf8("\xe9\x9b\xbb\xe9\x83\xb5");
        QTest::newRow("Devanagari with its marks") << QString::fromUtf8("\xe0\xa4\xa8\xe0\xa4\xbe\xe0\xa4\xae") << QString::fromUtf8("\xe0\xa4\xa8\xe0\xa4\xbe\xe0\xa4\xae");
        QTest::newRow("a letter beyond 16 bits") << QString::fromUtf8("k\xf0\x90\x90\x80/") << QString::fromUtf8("k\xf0\x90\x90\x80");
        // Keys that name no file are refused with a warning.
        QTest::newRow("refused: dot") << "." << ".";
        QTest::newRow("refused: dot dot") << ".." << "..";
        QTest::newRow("refused: empty") << "" << "";
        QTest::newRow("a letter beyond 16 bits that decodes to no letter when read wrongly")
                << QString::fromUtf8("x\xf0\x9d\x90\x80") << QString::fromUtf8("x\xf0\x9d\x90\x80");
        QTest::newRow("a lone low surrogate after a letter") << QStringLiteral("ab") + QChar(0xdc00) << "ab";
        QTest::newRow("200 bytes") << QString(200, QLatin1Char('k')) << QString(200, QLatin1Char('k'));
        QTest::newRow("refused: 201 bytes") << QString(201, QLatin1Char('k')) << QString(201, QLatin1Char('k'));
    }

    void keySanitising()
    {
        QFETCH(QString, key);
        QFETCH(QString, stored);
        AutoFill fill;
        fill.setKey(key);
        QCOMPARE(fill.key(), stored);
        // The key is the file's name, whole; nothing is ever written beside the folder.
        const bool refused = QByteArray(QTest::currentDataTag()).startsWith("refused");
        QTemporaryDir parent;
        const QString directory = parent.filePath(QStringLiteral("autofill"));
        AutoFillDatabase database(directory);
        if (refused)
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^AutoFill: the key .* does not name a file")));
        QCOMPARE(database.insert(fill.key(), QStringLiteral("remembered")), !refused);
        database.save();
        const QStringList beside = QDir(parent.path()).entryList(QDir::AllEntries | QDir::NoDotAndDotDot);
        QVERIFY(beside.isEmpty() || beside == QStringList({ "autofill" }));
        QCOMPARE(QDir(directory).entryList(QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden),
                 refused ? QStringList() : QStringList({ stored }));
        if (!refused)
            QCOMPARE(AutoFillDatabase::readFile(QDir(directory).filePath(stored)), QStringList({ "remembered" }));
    }

    // Newest first, a repeat moves to the front, fifty at most; saved one a line.
    void insertOrdersAndKeepsFifty()
    {
        QTemporaryDir dir;
        AutoFillDatabase database(dir.path());
        const QString k = QStringLiteral("k");
        QVERIFY(database.insert(k, QStringLiteral("first")));
        QVERIFY(database.insert(k, QStringLiteral("second")));
        QVERIFY(database.insert(k, QStringLiteral("first")));
        QCOMPARE(database.suggestions(k), QStringList({ "first", "second" }));
        database.save();
        QFile file(dir.filePath(k));
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(file.readAll(), QByteArray("first\nsecond\n"));

        for (int i = 1; i <= 51; ++i)
            database.insert(k, QStringLiteral("entry %1").arg(i));
        QStringList stored = database.suggestions(k);
        QCOMPARE(stored.size(), 50);
        QCOMPARE(stored.first(), QStringLiteral("entry 51"));
        QCOMPARE(stored.last(), QStringLiteral("entry 2"));
        database.insert(k, QStringLiteral("entry 30"));
        stored = database.suggestions(k);
        QCOMPARE(stored.size(), 50);
        QCOMPARE(stored.first(), QStringLiteral("entry 30"));
    }

    void visibleSuggestions_data()
    {
        QTest::addColumn<QString>("partial");
        QTest::addColumn<int>("maximum");
        QTest::addColumn<QStringList>("expected");
        QTest::newRow("no partial text") << "" << 3 << QStringList { "Hello", "he", "the" };
        QTest::newRow("contains, any case, not equal") << "he" << 10 << QStringList { "Hello", "the", "shell" };
        QTest::newRow("stops at the maximum") << "he" << 2 << QStringList { "Hello", "the" };
        QTest::newRow("nothing") << "xyz" << 10 << QStringList {};
        QTest::newRow("zero maximum") << "" << 0 << QStringList {};
    }

    void visibleSuggestions()
    {
        QFETCH(QString, partial);
        QFETCH(int, maximum);
        QFETCH(QStringList, expected);
        const QStringList stored { "Hello", "he", "the", "world", "shell" };
        QCOMPARE(AutoFill::visibleSuggestions(stored, partial, maximum), expected);
    }

    void unusableDirectoryKeepsSuggestionsInMemory()
    {
        QTemporaryDir parent;
        QFile blocker(parent.filePath(QStringLiteral("file")));
        QVERIFY(blocker.open(QIODevice::WriteOnly));
        blocker.close();
        // A folder below a plain file cannot be made, not even by root.
        AutoFillDatabase database(blocker.fileName() + QLatin1String("/autofill"));
        QTest::ignoreMessage(QtWarningMsg, "Unable to create a directory for the auto fill database.");
        QVERIFY(database.insert(QStringLiteral("k"), QStringLiteral("kept")));
        database.save();
        QCOMPARE(database.suggestions(QStringLiteral("k")), QStringList({ "kept" }));
    }

    void rewriteIsAtomic()
    {
        QTemporaryDir dir;
        const QString path = dir.filePath(QStringLiteral("k"));
        QStringList a, b;
        for (int i = 0; i < 200; ++i)
            a << QStringLiteral("old suggestion text %1").arg(i);
        for (int i = 0; i < 300; ++i)
            b << QStringLiteral("new suggestion, longer text %1").arg(i);
        QVERIFY(AutoFillDatabase::writeFile(path, a));
        QVERIFY(!AutoFillDatabase::writeFile(dir.filePath(QStringLiteral("missing/k")), a));

        std::atomic<bool> writing(true);
        std::atomic<int> torn(0);
        std::atomic<int> reads(0);
        std::thread reader([&] {
            while (writing) {
                const QStringList seen = AutoFillDatabase::readFile(path);
                if (seen != a && seen != b)
                    ++torn;
                ++reads;
            }
        });
        for (int i = 0; i < 300; ++i)
            QVERIFY(AutoFillDatabase::writeFile(path, i % 2 ? a : b));
        writing = false;
        reader.join();
        QVERIFY(reads > 0);
        QCOMPARE(torn.load(), 0);
        // No temporary files are left behind.
        QCOMPARE(QDir(dir.path()).entryList(QDir::Files), QStringList({ "k" }));
    }

    // A folder as it is found when first used: lines are read trimmed, blank ones skipped,
    // bad bytes kept; what a process killed while saving left behind goes, what another
    // process is writing right now stays.
    void folderAsFound()
    {
        QTemporaryDir dir;
        QFile email(dir.filePath(QStringLiteral("email")));
        QVERIFY(email.open(QIODevice::WriteOnly));
        email.write("  padded entry  \n\n\t\nsecond\r\n" + QByteArray(3000, 'x') + "\nbad \xff\xfe bytes\n");
        email.close();
        auto leave = [&dir](const QString &name, int age) {
            QFile file(dir.filePath(name));
            return file.open(QIODevice::WriteOnly) && file.write("half") == 4 && file.flush()
                    && file.setFileTime(QDateTime::currentDateTime().addSecs(-age), QFileDevice::FileModificationTime);
        };
        QVERIFY(leave(QStringLiteral("email.FvSQMO~"), 3600));
        QVERIFY(leave(QStringLiteral("phone.AbCdEf~"), 120));
        QVERIFY(leave(QStringLiteral("email.Xy12Zq~"), 0));
        AutoFillDatabase database(dir.path());
        const QStringList stored = database.suggestions(QStringLiteral("email"));
        QCOMPARE(stored.size(), 4);
        QCOMPARE(stored.mid(0, 2), QStringList({ "padded entry", "second" }));
        QCOMPARE(stored.at(2).size(), 3000);
        QVERIFY(stored.at(3).startsWith(QLatin1String("bad ")));
        QCOMPARE(QDir(dir.path()).entryList(QDir::Files), QStringList({ "email", "email.Xy12Zq~" }));
    }

    // The QML object: bad calls say why on the info log; good ones refresh the filtered
    // suggestions and are saved when it goes.
    void objectRefreshesAndSaves()
    {
        const QString key = QStringLiteral("objecttest");
        {
            AutoFill fill;
            QTest::ignoreMessage(QtInfoMsg, QRegularExpression(QStringLiteral("Cannot insert auto fill suggestions for an invalid key")));
            fill.insert(QStringLiteral("x"));
            QTest::ignoreMessage(QtInfoMsg, QRegularExpression(QStringLiteral("Cannot remove from a model with no key specified")));
            fill.remove(QStringLiteral("x"));
            fill.setKey(key);
            fill.componentComplete();
            QTest::ignoreMessage(QtInfoMsg, QRegularExpression(QStringLiteral("Cannot insert empty auto fill suggestions")));
            fill.insert(QStringLiteral("   "));
            fill.insert(QStringLiteral("  Helsinki   harbour "));
            fill.insert(QStringLiteral("Hamburg"));
            QTRY_COMPARE(fill.suggestions(), QStringList({ "Hamburg", "Helsinki harbour" }));
            fill.setPartialText(QStringLiteral("  HARB "));
            QCOMPARE(fill.partialText(), QStringLiteral("HARB"));
            QTRY_COMPARE(fill.suggestions(), QStringList({ "Helsinki harbour" }));

            QSignalSpy removed(&fill, &AutoFill::suggestionRemoved);
            fill.remove(QStringLiteral("Helsinki harbour"));
            QCOMPARE(fill.suggestions(), QStringList());
            QCOMPARE(removed.count(), 1);
            fill.setMaximumSuggestions(-4);
            QCOMPARE(fill.maximumSuggestions(), 0);
        } // saved on destruction

        QFile file(AutoFillDatabase::instance()->directory() + QLatin1Char('/') + key);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(file.readAll(), QByteArray("Hamburg\n"));
    }
};

QTEST_MAIN(tst_AutoFill)
#include "tst_autofill.moc"
