// Reading back a window's cover-action text, whatever another list or process wrote there.
#include "window/declarativecoveractionlist.h"
#include "fuzzinput.h"

#include <QUrl>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    FuzzInput in(data, size);
    const QString name = QStringLiteral("org.quorvaneos.coveraction.pid7.id") + QString::number(in.take<uint8_t>() % 4);
    const QString payload = QString::fromUtf8(in.restBytes());
    const QString left = DeclarativeCoverActionList::removeEntries(payload, name);
    // What is left names no entry of the list any more, and taking it out again changes nothing.
    if (DeclarativeCoverActionList::removeEntries(left, name) != left)
        __builtin_trap();
    const QString built = DeclarativeCoverActionList::buildPayload(1, true, name, { QUrl(payload) }, true);
    if (!DeclarativeCoverActionList::removeEntries(built, name).isEmpty() && !payload.contains(QLatin1Char('\n')))
        __builtin_trap();
    return 0;
}
