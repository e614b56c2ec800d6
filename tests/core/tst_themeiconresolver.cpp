#include "themeiconresolver.h"
#include "theme.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

using Pelkan::ThemeIconResolver;

class tst_ThemeIconResolver : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_theme.isValid());
        touch(QStringLiteral("icons/icon-a.png"));
        touch(QStringLiteral("icons/icon-a.svg"));
        touch(QStringLiteral("icons/z2.0/icon-a.png"));
        touch(QStringLiteral("icons/icon-svg-only.svg"));
        touch(QStringLiteral("icons/z1.5/icon-ratio-only.png"));
        touch(QStringLiteral("icons/icon-both.png"));
        touch(QStringLiteral("graphics/icon-both.png"));
        touch(QStringLiteral("graphics/graphic-pattern.png"));
        touch(QStringLiteral("graphics/z2.0/graphic-pattern.svg"));
        touch(QStringLiteral("graphics/photo.jpg"));
        touch(QStringLiteral("secret.png"));
    }

    void resolve_data()
    {
        QTest::addColumn<qreal>("ratio");
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("expected"); // relative to the theme, or absolute, or empty

        QTest::newRow("plain png beats svg") << 1.0 << "icon-a" << "icons/icon-a.png";
        QTest::newRow("ratio folder first") << 2.0 << "icon-a" << "icons/z2.0/icon-a.png";
        QTest::newRow("other ratio uses base") << 1.5 << "icon-a" << "icons/icon-a.png";
        QTest::newRow("svg only") << 2.0 << "icon-svg-only" << "icons/icon-svg-only.svg";
        QTest::newRow("ratio only, matching") << 1.5 << "icon-ratio-only" << "icons/z1.5/icon-ratio-only.png";
        QTest::newRow("ratio only, other ratio") << 1.0 << "icon-ratio-only" << "";
        QTest::newRow("icons before graphics") << 1.0 << "icon-both" << "icons/icon-both.png";
        QTest::newRow("graphics folder") << 1.0 << "graphic-pattern" << "graphics/graphic-pattern.png";
        QTest::newRow("graphics ratio svg beats base png") << 2.0 << "graphic-pattern" << "graphics/z2.0/graphic-pattern.svg";
        QTest::newRow("explicit suffix") << 1.0 << "photo.jpg" << "graphics/photo.jpg";
        QTest::newRow("explicit suffix, other type absent") << 1.0 << "icon-svg-only.png" << "";
        QTest::newRow("unknown") << 1.0 << "icon-missing" << "";
        QTest::newRow("empty") << 1.0 << "" << "";
        QTest::newRow("relative path") << 1.0 << "icons/icon-a" << "";
        QTest::newRow("parent escape") << 1.0 << "../secret" << "";
        QTest::newRow("dot dot") << 1.0 << ".." << "";
        QTest::newRow("absolute passes through") << 1.0 << "/elsewhere/image.png" << "/elsewhere/image.png";
        QTest::newRow("file url") << 1.0 << "file:///elsewhere/my%20image.png" << "/elsewhere/my image.png";
    }

    void resolve()
    {
        QFETCH(qreal, ratio);
        QFETCH(QString, name);
        QFETCH(QString, expected);
        const ThemeIconResolver resolver(m_theme.path(), ratio);
        const QString path = resolver.resolvePath(name);
        if (expected.isEmpty() || expected.startsWith(QLatin1Char('/')))
            QCOMPARE(path, expected);
        else
            QCOMPARE(path, m_theme.filePath(expected));
        // The cached answer is the same.
        QCOMPARE(resolver.resolvePath(name), path);
    }

    void ratioFolder_data()
    {
        QTest::addColumn<qreal>("ratio");
        QTest::addColumn<QString>("folder");
        QTest::newRow("1") << 1.0 << "z1.0";
        QTest::newRow("1.25") << 1.25 << "z1.25";
        QTest::newRow("1.5") << 1.5 << "z1.5";
        QTest::newRow("1.75") << 1.75 << "z1.75";
        QTest::newRow("2") << 2.0 << "z2.0";
    }

    void ratioFolder()
    {
        QFETCH(qreal, ratio);
        QFETCH(QString, folder);
        QCOMPARE(ThemeIconResolver::ratioFolder(ratio), folder);
    }

    void cacheKeepsResultsUntilCleared()
    {
        const ThemeIconResolver resolver(m_theme.path(), 1.0);
        QCOMPARE(resolver.resolvePath(QStringLiteral("icon-new")), QString());
        touch(QStringLiteral("icons/icon-new.svg"));
        QCOMPARE(resolver.resolvePath(QStringLiteral("icon-new")), QString());
        ThemeIconResolver::clearCache();
        QCOMPARE(resolver.resolvePath(QStringLiteral("icon-new")), m_theme.filePath(QStringLiteral("icons/icon-new.svg")));
    }

    void defaultThemeHasItsIcons()
    {
        const ThemeIconResolver resolver(Pelkan::Theme::defaultThemeDirectory(), 1.0);
        QVERIFY(!resolver.resolvePath(QStringLiteral("icon-m-back")).isEmpty());
        QVERIFY(!resolver.resolvePath(QStringLiteral("graphic-shader-texture")).isEmpty());
    }

private:
    void touch(const QString &relative);
    QTemporaryDir m_theme;
};

void tst_ThemeIconResolver::touch(const QString &relative)
{
    const QString path = m_theme.filePath(relative);
    QDir().mkpath(QFileInfo(path).absolutePath());
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
}

QTEST_GUILESS_MAIN(tst_ThemeIconResolver)
#include "tst_themeiconresolver.moc"
