#include "coveractionpayload.h"

#include <QStringList>

CoverActionPayload CoverActionPayload::parse(const QString &text)
{
    CoverActionPayload payload;
    // Everything taken out again leaves an empty text: no actions.
    if (text.isEmpty())
        return payload;

    const QStringList lines = text.split(QLatin1Char('\n'));
    if (lines.size() % 4 != 1) {
        payload.error = QStringLiteral("%1 lines, expected four per action and one more").arg(lines.size());
        return payload;
    }
    const QString &background = lines.last();
    if (background != QLatin1String("0") && background != QLatin1String("1")) {
        payload.error = QStringLiteral("bad icon background line: %1").arg(background);
        return payload;
    }
    payload.iconBackground = background == QLatin1String("1");

    for (int i = 0; i + 4 < lines.size(); i += 4) {
        Action action;
        action.service = lines.at(i);
        action.method = lines.at(i + 1);
        bool ok = false;
        action.index = lines.at(i + 2).toInt(&ok);
        action.icon = lines.at(i + 3);
        if (action.service.isEmpty() || action.method.isEmpty() || !ok) {
            payload.error = QStringLiteral("bad action at line %1").arg(i + 1);
            payload.actions.clear();
            return payload;
        }
        payload.actions.append(action);
    }
    return payload;
}

QString CoverActionPayload::objectPath(const QString &service)
{
    return QLatin1Char('/') + QString(service).replace(QLatin1Char('.'), QLatin1Char('/'));
}
