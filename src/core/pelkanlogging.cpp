#include "pelkanlogging.h"

Q_LOGGING_CATEGORY(lcPelkanCoreLog, "org.quorvaneos.pelkan.core", QtWarningMsg)
Q_LOGGING_CATEGORY(lcPelkanConfigLog, "org.quorvaneos.pelkan.config", QtWarningMsg)
Q_LOGGING_CATEGORY(lcPelkanThemeLog, "org.quorvaneos.pelkan.theme", QtWarningMsg)
Q_LOGGING_CATEGORY(lcPelkanServicesLog, "org.quorvaneos.pelkan.services", QtWarningMsg)
Q_LOGGING_CATEGORY(lcPelkanPageStackLog, "org.quorvaneos.pelkan.pagestackbase", QtWarningMsg)
Q_LOGGING_CATEGORY(lcPelkanCoverLog, "org.quorvaneos.pelkan.cover", QtWarningMsg)
