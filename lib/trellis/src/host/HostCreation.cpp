#include "host/HostCreation.h"

#include <fcntl.h>
#include <signal.h>
#include <stdio.h>
#include <sys/types.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <filesystem>

#include "host/Schema.h"
#include "host/Store.h"
#include "host/description/DescriptionIo.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {

[[noreturn]] void Refuse(const std::string& path, const std::string& problem) {
    throw HostOpenError("Cannot create the host " + path + ": " + problem);
}

void SyncPath(const std::string& path, int flags) {
    int fd = ::open(path.c_str(), flags | O_CLOEXEC);
    if (fd < 0) return;
    ::fsync(fd);
    ::close(fd);
}

// A temporary host is named "<host>.new-<pid>-<n>"; SQLite may add
// "-journal", "-wal" or "-shm" to that name.
const char* const kTemporaryMark = ".new-";
const char* const kCompanionSuffixes[] = {"", "-journal", "-wal", "-shm"};

// A new empty file of a unique name beside path, with the permissions a
// file created by the user would have; the caller removes it.
std::string MakeTemporaryBeside(const std::string& path) {
    for (int attempt = 0;; ++attempt) {
        std::string name = path + kTemporaryMark + std::to_string(::getpid()) + "-" + std::to_string(attempt);
        int fd = ::open(name.c_str(), O_CREAT | O_EXCL | O_WRONLY | O_CLOEXEC, 0666);
        if (fd >= 0) {
            ::close(fd);
            return name;
        }
        if (errno != EEXIST || attempt > 100) Refuse(path, std::strerror(errno));
    }
}

// Builds the whole default host in the file at temporary.
void BuildDefaultHost(const std::string& temporary) {
    auto db = std::make_unique<Database>(temporary, Database::Mode::ReadWrite);
    // The file is not visible yet: no journal is needed while it is built.
    db->Execute("PRAGMA journal_mode = MEMORY; PRAGMA synchronous = OFF");
    Store store(temporary, std::move(db));
    {
        TransactionScope scope(store, true);
        CreateBaseSchema(store.Db());
        UpgradeTableLayout(store.Db());
        WriteDescription(scope.Get(), DefaultDescription());
        store.Db().Execute("PRAGMA user_version = " + std::to_string(LatestSchemaVersion()));
        scope.Commit();
    }
}

class RemoveOnExit {
public:
    explicit RemoveOnExit(std::string path) : path_(std::move(path)) {}
    ~RemoveOnExit() {
        for (const char* suffix : kCompanionSuffixes) ::unlink((path_ + suffix).c_str());
    }

private:
    std::string path_;
};

// The process that made a temporary of the name rest ("<pid>-<n>" and a
// companion suffix, what follows the mark), or 0 when rest is not of that form.
pid_t CreatorOf(const std::string& rest) {
    std::size_t dash = rest.find('-');
    if (dash == 0 || dash == std::string::npos || dash > 9) return 0;
    if (rest.find_first_not_of("0123456789") != dash) return 0;
    std::size_t counterEnd = rest.find_first_not_of("0123456789", dash + 1);
    if (counterEnd == dash + 1) return 0;
    std::string suffix = counterEnd == std::string::npos ? "" : rest.substr(counterEnd);
    bool known = false;
    for (const char* companion : kCompanionSuffixes) known = known || suffix == companion;
    return known ? static_cast<pid_t>(std::stol(rest.substr(0, dash))) : 0;
}

bool ProcessExists(pid_t pid) {
    // EPERM: it exists, as another user's process.
    return ::kill(pid, 0) == 0 || errno != ESRCH;
}

}  // namespace

void RemoveAbandonedTemporaries(const std::string& path) {
    std::error_code error;
    std::filesystem::path host = std::filesystem::absolute(path, error);
    if (error) return;
    const std::string prefix = host.filename().string() + kTemporaryMark;
    // No directory yet, or one we may not list: nothing to remove.
    for (std::filesystem::directory_iterator entries(host.parent_path(), error), end; !error && entries != end;
         entries.increment(error)) {
        std::string name = entries->path().filename().string();
        if (name.compare(0, prefix.size(), prefix) != 0) continue;
        pid_t creator = CreatorOf(name.substr(prefix.size()));
        if (creator > 0 && !ProcessExists(creator)) ::unlink(entries->path().c_str());
    }
}

void CreateHostFile(const std::string& path) {
    std::error_code error;
    std::filesystem::path directory = std::filesystem::absolute(path, error).parent_path();
    if (error) Refuse(path, error.message());
    std::filesystem::create_directories(directory, error);
    if (error) Refuse(path, "cannot create the directory " + directory.string() + ": " + error.message());

    std::string temporary = MakeTemporaryBeside(path);
    RemoveOnExit removeTemporary(temporary);
    try {
        BuildDefaultHost(temporary);
    } catch (const std::exception& e) {
        Refuse(path, e.what());
    }
    SyncPath(temporary, O_RDONLY);
    // link(2) fails if path exists: a host that another process created
    // meanwhile wins, and ours is dropped.
    if (::link(temporary.c_str(), path.c_str()) != 0 && errno != EEXIST) {
        // File systems without hard links: the same test, by rename.
        if (errno != EPERM && errno != EOPNOTSUPP) Refuse(path, std::strerror(errno));
        if (::renameat2(AT_FDCWD, temporary.c_str(), AT_FDCWD, path.c_str(), RENAME_NOREPLACE) != 0 &&
            errno != EEXIST)
            Refuse(path, std::strerror(errno));
    }
    SyncPath(directory.string(), O_RDONLY | O_DIRECTORY);
}

}  // namespace Host
}  // namespace Trellis
