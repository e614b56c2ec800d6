#pragma once

#include <QLoggingCategory>

// Every logging category of the toolkit, in one place. Warnings are on by default,
// debug output is off; enable it with QT_LOGGING_RULES="org.quorvaneos.pelkan.*.debug=true".
Q_DECLARE_LOGGING_CATEGORY(lcPelkanCoreLog)
Q_DECLARE_LOGGING_CATEGORY(lcPelkanConfigLog)
Q_DECLARE_LOGGING_CATEGORY(lcPelkanThemeLog)
Q_DECLARE_LOGGING_CATEGORY(lcPelkanServicesLog)
Q_DECLARE_LOGGING_CATEGORY(lcPelkanPageStackLog)
Q_DECLARE_LOGGING_CATEGORY(lcPelkanCoverLog)
