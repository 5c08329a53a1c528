#include "base/SqliteDatabase.h"

#include <array>
#include <cerrno>
#include <chrono>
#include <cstring>
#include <ctime>
#include <fcntl.h>
#include <set>
#include <sqlite3.h>
#include <sys/stat.h>
#include <thread>
#include <unistd.h>
#include <utility>

namespace base {

namespace {

using FileKey = std::pair<std::string, std::uint64_t>;

/** The files that this process has found whole, by path and inode. */
std::set<FileKey>& wholeFiles() {
    static std::set<FileKey> files;
    return files;
}

bool isDamage(int result) {
    return (result & 0xff) == SQLITE_CORRUPT || (result & 0xff) == SQLITE_NOTADB;
}

std::string fullPath(sqlite3* database) {
    const char* path = database ? sqlite3_db_filename(database, "main") : nullptr;
    return path ? path : "";
}

/** Makes the next open() check a file again. */
void distrust(sqlite3* database) {
    const auto path = fullPath(database);
    std::erase_if(wholeFiles(), [&](const FileKey& key) { return key.first == path; });
}

std::uint64_t fileNumber(const std::string& path) {
    struct stat status {};
    return stat(path.c_str(), &status) == 0 ? status.st_ino : 0;
}

/** False when a file has content that does not begin as a database does. */
bool beginsAsDatabase(const std::string& path) {
    const int file = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (file < 0)
        return true;
    std::array<char, 16> head{};
    const auto size = ::read(file, head.data(), head.size());
    ::close(file);
    return size <= 0 || std::memcmp(head.data(), "SQLite format 3", head.size()) == 0;
}

bool exists(const std::string& path) {
    return ::access(path.c_str(), F_OK) == 0;
}

/** A name beside a damaged file that none of its three parts has taken yet. */
std::string freeName(const std::string& path) {
    for (auto second = std::time(nullptr);; ++second) {
        auto name = path + ".corrupt-" + std::to_string(second);
        if (!exists(name) && !exists(name + "-wal") && !exists(name + "-shm"))
            return name;
    }
}

std::string newerVersion(std::string_view owner, int version, int known) {
    return "written by a newer version (" + std::string(owner) + " " + std::to_string(version) +
           ", this one knows " + std::to_string(known) + ")";
}

std::string percentEncoded(const std::string& path) {
    constexpr std::string_view hex = "0123456789ABCDEF";
    std::string encoded;
    for (const char c : path) {
        const auto byte = static_cast<unsigned char>(c);
        if (c != '%' && c != '?' && c != '#')
            encoded += c;
        else
            (encoded += '%').append({hex[byte >> 4U], hex[byte & 15U]});
    }
    return encoded;
}

} // namespace

SqliteStatement::SqliteStatement(sqlite3_stmt* statement, std::shared_ptr<std::string> error)
    : _statement(statement), _error(std::move(error)), _failed(statement == nullptr) {}

void SqliteStatement::fail() {
    _failed = true;
    if (_statement)
        *_error = sqlite3_errmsg(sqlite3_db_handle(_statement.get()));
}

void SqliteStatement::Finalizer::operator()(sqlite3_stmt* statement) const {
    sqlite3_finalize(statement);
}

SqliteStatement& SqliteStatement::bind(int parameter, std::int64_t value) {
    if (!_statement || sqlite3_bind_int64(_statement.get(), parameter, value) != SQLITE_OK)
        fail();
    return *this;
}

SqliteStatement& SqliteStatement::bind(int parameter, std::string_view value) {
    const char* data = value.empty() ? "" : value.data();
    if (!_statement || sqlite3_bind_text64(_statement.get(), parameter, data, value.size(),
                                           SQLITE_TRANSIENT, SQLITE_UTF8) != SQLITE_OK)
        fail();
    return *this;
}

bool SqliteStatement::step() {
    if (_failed)
        return false;
    const int result = sqlite3_step(_statement.get());
    if (result == SQLITE_ROW)
        return true;
    if (result != SQLITE_DONE) {
        fail();
        if (isDamage(result))
            distrust(sqlite3_db_handle(_statement.get()));
    }
    return false;
}

bool SqliteStatement::run() {
    while (step()) {
    }
    if (_failed)
        return false;
    sqlite3_reset(_statement.get());
    return true;
}

std::int64_t SqliteStatement::integer(int column) const {
    return _statement ? sqlite3_column_int64(_statement.get(), column) : 0;
}

std::string SqliteStatement::text(int column) const {
    if (!_statement)
        return {};
    const auto* data = sqlite3_column_text(_statement.get(), column);
    const auto size = sqlite3_column_bytes(_statement.get(), column);
    return data ? std::string(reinterpret_cast<const char*>(data), static_cast<std::size_t>(size))
                : std::string();
}

SqliteDatabase::SqliteDatabase(std::string path, int busyTimeoutMs)
    : _path(std::move(path)), _busyTimeoutMs(busyTimeoutMs) {}

SqliteDatabase::~SqliteDatabase() = default;

void SqliteDatabase::Closer::operator()(sqlite3* database) const {
    sqlite3_close_v2(database);
}

bool SqliteDatabase::open(std::string_view owner, const std::vector<std::string>& migrations) {
    _quarantinePath.clear();
    _error->clear();
    // Damage that shows only in use leads to a check, a failed check to a quarantine, and that to a
    // new file.
    for (int round = 0; round < 3; ++round) {
        const bool opened = beginsAsDatabase(_path) ? openFile() : fail("not a database");
        const auto health = opened ? checkIntegrity() : Health::Unknown;
        if (health == Health::Good && migrate(owner, migrations))
            return true;
        if (health == Health::Good && !isTrusted())
            continue;
        const bool damaged = health == Health::Damaged || !beginsAsDatabase(_path) ||
                             (_database && isDamage(sqlite3_errcode(_database.get())));
        if (!damaged || !quarantine())
            break;
    }
    _database.reset();
    return false;
}

bool SqliteDatabase::isTrusted() const {
    return wholeFiles().contains({fullPath(_database.get()), _fileNumber});
}

bool SqliteDatabase::connect(const std::string& name, int flags) {
    sqlite3* database = nullptr;
    const int result = sqlite3_open_v2(name.c_str(), &database, flags, nullptr);
    _database.reset(database);
    if (result == SQLITE_OK)
        return true;
    // The message of a failed open leaves out why the system refused the file.
    const int system = database ? sqlite3_system_errno(database) : 0;
    const std::string reason = database ? sqlite3_errmsg(database) : "out of memory";
    fail(system != 0 ? reason + ": " + std::strerror(system) : reason);
    _database.reset();
    return false;
}

bool SqliteDatabase::openFile() {
    if (_path.empty())
        return fail("no file name");
    if (!connect(_path, SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE))
        return false;
    _fileNumber = fileNumber(_path);
    return prepareConnection() || openImmutable();
}

bool SqliteDatabase::openImmutable() {
    // Without the right to write beside it SQLite cannot open a file that has a log, although it
    // can be read well as long as the log is empty.
    const bool readOnly = _database && sqlite3_db_readonly(_database.get(), "main") == 1;
    const auto slash = _path.rfind('/');
    const auto folder = slash == std::string::npos ? "." : _path.substr(0, slash + 1);
    if (!(readOnly || ::access(folder.c_str(), W_OK) != 0) || !exists(_path) ||
        exists(_path + "-wal"))
        return false;
    if (!connect("file:" + percentEncoded(_path) + "?immutable=1",
                 SQLITE_OPEN_READONLY | SQLITE_OPEN_URI))
        return false;
    _error->clear();
    return true;
}

bool SqliteDatabase::prepareConnection() {
    auto* database = _database.get();
    sqlite3_extended_result_codes(database, 1);
    sqlite3_busy_timeout(database, _busyTimeoutMs);
    const auto deadline =
        std::chrono::steady_clock::now() + std::chrono::milliseconds(_busyTimeoutMs);
    // SQLite does not wait by itself where two processes switch a new file to the log at once.
    while (!execute("PRAGMA journal_mode = WAL")) {
        const bool busy = (sqlite3_errcode(database) & 0xff) == SQLITE_BUSY;
        if (!busy || std::chrono::steady_clock::now() >= deadline)
            return false;
        std::this_thread::sleep_for(std::chrono::milliseconds(5));
    }
    return execute("PRAGMA synchronous = FULL; PRAGMA trusted_schema = OFF");
}

bool SqliteDatabase::relax() {
    if (!execute("PRAGMA synchronous = NORMAL"))
        return false;
    sqlite3_db_config(_database.get(), SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr);
    return true;
}

SqliteDatabase::Health SqliteDatabase::checkIntegrity() {
    if (isTrusted())
        return Health::Good;
    auto check = prepare("PRAGMA quick_check(1)");
    if (check.step() && check.text(0) == "ok") {
        wholeFiles().insert({fullPath(_database.get()), _fileNumber});
        return Health::Good;
    }
    if (!check.failed())
        fail(check.text(0));
    else if (!isDamage(sqlite3_errcode(_database.get())))
        return Health::Unknown;
    return Health::Damaged;
}

/** A missing row or table is version 0. */
bool SqliteDatabase::readVersion(std::string_view owner, int& version) {
    version = 0;
    auto table =
        prepare("SELECT 1 FROM sqlite_schema WHERE type = 'table' AND name = 'schema_version'");
    if (!table.step())
        return !table.failed();
    auto row = prepare("SELECT version FROM schema_version WHERE owner = ?1");
    if (row.bind(1, owner).step())
        version = static_cast<int>(row.integer(0));
    return !row.failed();
}

bool SqliteDatabase::migrate(std::string_view owner, const std::vector<std::string>& migrations) {
    const int wanted = static_cast<int>(migrations.size());
    int version = 0;
    if (!readVersion(owner, version))
        return false;
    if (version == wanted)
        return true;
    if (version > wanted || version < 0)
        return fail(newerVersion(owner, version, wanted));
    return transaction([&] { return applyMigrations(owner, migrations); });
}

bool SqliteDatabase::applyMigrations(std::string_view owner,
                                     const std::vector<std::string>& migrations) {
    // Another process may have done part of the work since the version was read.
    int version = 0;
    if (!readVersion(owner, version) ||
        !execute("CREATE TABLE IF NOT EXISTS schema_version("
                 "owner TEXT PRIMARY KEY, version INTEGER NOT NULL) STRICT"))
        return false;
    if (version > static_cast<int>(migrations.size()))
        return fail(newerVersion(owner, version, static_cast<int>(migrations.size())));
    for (auto i = static_cast<std::size_t>(version); i < migrations.size(); ++i)
        if (!execute(migrations[i]))
            return false;
    auto write = prepare("INSERT INTO schema_version(owner, version) VALUES(?1, ?2) "
                         "ON CONFLICT(owner) DO UPDATE SET version = excluded.version");
    return write.bind(1, owner).bind(2, static_cast<std::int64_t>(migrations.size())).run();
}

bool SqliteDatabase::quarantine() {
    const auto examined = _database ? _fileNumber : fileNumber(_path);
    if (_database) {
        distrust(_database.get());
        // What is left in the log is evidence, too.
        sqlite3_db_config(_database.get(), SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr);
    }
    _database.reset();
    if (fileNumber(_path) != examined)
        return true; // Another process was faster and has started a new file.
    const auto aside = freeName(_path);
    // The log goes first: beside a new file it would be replayed into it.
    for (const char* part : {"-wal", "-shm", ""}) {
        if (std::rename((_path + part).c_str(), (aside + part).c_str()) != 0 && errno != ENOENT)
            return fail(*_error + ", and it cannot be moved aside: " + std::strerror(errno));
    }
    _quarantinePath = aside;
    _error->clear();
    return true;
}

std::string SqliteDatabase::lastError() const {
    if (!_error->empty())
        return *_error;
    return _database ? "no error" : "not open";
}

bool SqliteDatabase::fail(const std::string& reason) {
    *_error = reason;
    return false;
}

bool SqliteDatabase::failWithSqliteError() {
    if (isDamage(sqlite3_errcode(_database.get())))
        distrust(_database.get());
    return fail(sqlite3_errmsg(_database.get()));
}

SqliteStatement SqliteDatabase::prepare(std::string_view sql) {
    sqlite3_stmt* statement = nullptr;
    if (_database) {
        _error->clear();
        if (sqlite3_prepare_v2(_database.get(), sql.data(), static_cast<int>(sql.size()),
                               &statement, nullptr) != SQLITE_OK)
            failWithSqliteError();
    }
    return SqliteStatement(statement, _error);
}

bool SqliteDatabase::execute(const std::string& sql) {
    if (!_database)
        return false;
    _error->clear();
    return sqlite3_exec(_database.get(), sql.c_str(), nullptr, nullptr, nullptr) == SQLITE_OK ||
           failWithSqliteError();
}

bool SqliteDatabase::transaction(const std::function<bool()>& body) {
    if (!execute("BEGIN IMMEDIATE"))
        return false;
    if (body() && execute("COMMIT"))
        return true;
    // The rollback must not hide the reason.
    const auto reason = *_error;
    if (sqlite3_get_autocommit(_database.get()) == 0)
        execute("ROLLBACK");
    return fail(reason);
}

std::int64_t SqliteDatabase::lastInsertId() const {
    return _database ? sqlite3_last_insert_rowid(_database.get()) : 0;
}

std::int64_t SqliteDatabase::changes() const {
    return _database ? sqlite3_changes64(_database.get()) : 0;
}

} // namespace base
