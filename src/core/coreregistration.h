#pragma once

class QQmlEngine;

namespace Pelkan {
namespace Private {

// What the core library contributes to the QML modules; the plugin calls these before
// registering its own tables.
void registerTypes(const char *uri);        // "Quorvane.Pelkan"
void registerPrivateTypes(const char *uri); // "Quorvane.Pelkan.private"
void initializeEngine(QQmlEngine *engine, const char *uri);

} // namespace Private
} // namespace Pelkan
