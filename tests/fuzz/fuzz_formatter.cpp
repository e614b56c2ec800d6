// The formatter's operations with any numbers, dates, texts and translated patterns.
#include "text/declarativeformatter.h"
#include "fuzzinput.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QTranslator>

namespace {

// Whatever the input says a duration or size pattern is translated as.
class FuzzedCatalogue : public QTranslator
{
public:
    QString pattern;
    bool isEmpty() const override { return false; }
    QString translate(const char *, const char *id, const char *, int) const override
    {
        return qstrncmp(id, "quorvanepelkan-", 15) == 0 ? pattern : QString();
    }
};

FuzzedCatalogue *s_catalogue = nullptr;

} // namespace

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv)
{
    new QCoreApplication(*argc, *argv);
    s_catalogue = new FuzzedCatalogue;
    QCoreApplication::installTranslator(s_catalogue);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    FuzzInput in(data, size);
    const int type = in.take<int8_t>();
    const int seconds = in.take<int32_t>();
    const qint64 bytes = in.take<int64_t>();
    const int precision = in.take<int32_t>();
    const qint64 msecs = in.take<int64_t>();
    s_catalogue->pattern = in.takeText(in.take<uint8_t>() % 64);
    const QString text = in.rest();

    DeclarativeFormatter formatter;
    const QDateTime date = QDateTime::fromMSecsSinceEpoch(msecs, Qt::UTC);
    formatter.formatDate(date, type);
    formatter.formatDuration(seconds, type % 2 ? DeclarativeFormatter::DurationShort : DeclarativeFormatter::DurationLong);
    formatter.formatFileSize(bytes, precision);
    formatter.formatText(text, type & 1);
    formatter.textDirection(text);
    formatter._joinNames(text, s_catalogue->pattern);
    return 0;
}
