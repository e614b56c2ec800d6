#pragma once

// The sound-profile client: which profile is active ("general", "silent", ...) and its
// values, followed live. The profile service keeps them in device configuration:
//     /quorvane/profile/active                      the active profile's name
//     /quorvane/profile/<profile>/<key>             its values ("touchscreen.tone.volume", 0-100)
// so that the service, a settings application or `dconf write` changes them while
// applications run. Callbacks run on the thread that called profile_tracker_init(), from
// its event loop. Missing values read as 0; an unset active profile reads as "general".

#ifdef __cplusplus
extern "C" {
#endif

typedef void (*profile_track_profile_fn)(const char *profile, void *user_data);
typedef void (*profile_track_value_fn)(const char *profile, const char *key, const char *value,
                                       const char *type, void *user_data);
typedef void (*profile_user_data_free_fn)(void *user_data);

// Starts following changes; returns 0 on success. Balanced by profile_tracker_quit().
int profile_tracker_init(void);
void profile_tracker_quit(void);

// The active profile's name; free() it.
char *profile_get_profile(void);
int profile_get_value_as_int(const char *profile, const char *key);
// profile null: the active one.
int profile_get_value_as_bool(const char *profile, const char *key);

void profile_track_add_active_cb(profile_track_profile_fn callback, void *user_data,
                                 profile_user_data_free_fn free_user_data);
void profile_track_remove_active_cb(profile_track_profile_fn callback, void *user_data);
// Values of the active profile changing (also when another profile becomes active).
void profile_track_add_change_cb(profile_track_value_fn callback, void *user_data,
                                 profile_user_data_free_fn free_user_data);
void profile_track_remove_change_cb(profile_track_value_fn callback, void *user_data);

#ifdef __cplusplus
}
#endif
