#pragma once

// The registration tables of the three modules; each registers only its own module.
namespace ModuleRegistration {

void registerPublicModule(const char *uri);
void registerPrivateModule(const char *uri);
void registerThemeModule(const char *uri);

} // namespace ModuleRegistration
