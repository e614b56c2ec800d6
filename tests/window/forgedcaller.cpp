// A caller that presses a cover action at once (plain, action <index>, default 0), or
// connects as an ordinary user and presses action 0 after making the process behind its
// connection look privileged, the two ways an attacker would.
//
//   forgedcaller plain    <bus> <service> <path> <result-file> [index]
//   forgedcaller setuid   <bus> <service> <path> <result-file> <blocking set-uid program>
//       Forks. The parent executes the set-uid program; the child waits until its parent's
//       /proc entry is root's and calls.
//   forgedcaller pidreuse <bus> <service> <path> <result-file>
//       Forks. The parent writes its pid to <result-file>.pid and exits; the child waits
//       until a root process holds that pid and calls.
//
// The child writes "ok", or the error's name and message on two lines, to <result-file>.
// Plain libdbus: a connection that outlives a fork needs a library without threads.
#include <dbus/dbus.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace {

void writeFile(const std::string &path, const std::string &text)
{
    const std::string temporary = path + ".part";
    if (FILE *file = std::fopen(temporary.c_str(), "w")) {
        std::fputs(text.c_str(), file);
        std::fclose(file);
        std::rename(temporary.c_str(), path.c_str());
    }
}

bool waitForRootOwner(pid_t pid)
{
    const std::string entry = "/proc/" + std::to_string(pid);
    for (int i = 0; i < 1000; ++i) {
        struct stat info;
        if (::stat(entry.c_str(), &info) == 0 && info.st_uid == 0)
            return true;
        ::usleep(10000);
    }
    return false;
}

std::string pressAction(DBusConnection *connection, const char *service, const char *path, dbus_int32_t index = 0)
{
    DBusMessage *call = dbus_message_new_method_call(service, path, "org.quorvaneos.pelkan.coveraction", "trigger");
    dbus_message_append_args(call, DBUS_TYPE_INT32, &index, DBUS_TYPE_INVALID);
    DBusError error;
    dbus_error_init(&error);
    DBusMessage *reply = dbus_connection_send_with_reply_and_block(connection, call, 5000, &error);
    dbus_message_unref(call);
    if (reply) {
        dbus_message_unref(reply);
        return "ok";
    }
    std::string text = std::string(error.name) + "\n" + error.message;
    dbus_error_free(&error);
    return text;
}

} // namespace

int main(int argc, char **argv)
{
    const bool setuid = argc == 7 && std::strcmp(argv[1], "setuid") == 0;
    const bool reuse = argc == 6 && std::strcmp(argv[1], "pidreuse") == 0;
    const bool plain = (argc == 6 || argc == 7) && std::strcmp(argv[1], "plain") == 0;
    if (!setuid && !reuse && !plain) {
        std::fprintf(stderr, "usage: %s plain|setuid|pidreuse bus service path result-file [index|program]\n", argv[0]);
        return 2;
    }
    DBusError error;
    dbus_error_init(&error);
    DBusConnection *connection = dbus_connection_open_private(argv[2], &error);
    if (!connection || !dbus_bus_register(connection, &error)) {
        std::fprintf(stderr, "cannot connect: %s\n", error.message);
        return 1;
    }
    const std::string result = argv[5];
    if (plain) {
        writeFile(result, pressAction(connection, argv[3], argv[4], argc == 7 ? std::atoi(argv[6]) : 0));
        return 0;
    }
    const pid_t opener = ::getpid();
    const pid_t child = ::fork();
    if (child < 0)
        return 1;
    if (child > 0) {
        if (setuid) {
            ::execl(argv[6], argv[6], "30", static_cast<char *>(nullptr));
            return 1;
        }
        writeFile(result + ".pid", std::to_string(opener));
        ::_exit(0);
    }
    if (!waitForRootOwner(opener)) {
        writeFile(result, "timeout\nthe opener's pid never became root's");
        return 1;
    }
    writeFile(result, pressAction(connection, argv[3], argv[4]));
    return 0;
}
