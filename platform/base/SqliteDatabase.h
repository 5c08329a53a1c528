/**
 * @file
 * @brief SQLite with owned handles.
 */
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

struct sqlite3;
struct sqlite3_stmt;

namespace base {

class SqliteDatabase;

/** One prepared statement. Parameters are numbered from 1, columns from 0, as in SQLite. */
class SqliteStatement {
public:
    /** Binds an integer. */
    SqliteStatement& bind(int parameter, std::int64_t value);
    /** Binds a text; copied. */
    SqliteStatement& bind(int parameter, std::string_view value);
    /** Moves to the next row. @return False at the end and on failure. */
    bool step();
    /** Runs a statement that returns no rows. @return False on failure. */
    bool run();
    /** True when the last step() or run() failed. */
    bool failed() const { return _failed; }
    std::int64_t integer(int column) const;
    std::string text(int column) const;

private:
    friend class SqliteDatabase;
    SqliteStatement(sqlite3_stmt* statement, std::shared_ptr<std::string> error);
    void fail();
    struct Finalizer {
        void operator()(sqlite3_stmt* statement) const;
    };
    std::unique_ptr<sqlite3_stmt, Finalizer> _statement;
    // Shared with the database, which forgets the reason when the next statement is dropped.
    std::shared_ptr<std::string> _error;
    bool _failed = false;
};

/**
 * @brief One connection to a database file in write-ahead-log mode.
 *
 * A committed transaction is on the disk: neither a killed process nor a power cut loses it.
 * Several owners may keep tables in one file: each has its own chain of migrations, and the number
 * of those applied is kept in the table "schema_version". Failures are reported by return values;
 * lastError() tells the reason.
 */
class SqliteDatabase {
public:
    /** Waits at most `busyTimeoutMs` for another process's write lock. */
    explicit SqliteDatabase(std::string path, int busyTimeoutMs = 1000);
    ~SqliteDatabase();
    SqliteDatabase(const SqliteDatabase&) = delete;
    SqliteDatabase& operator=(const SqliteDatabase&) = delete;

    /**
     * @brief Opens the file, creating it when it is missing, and applies an owner's migrations.
     *
     * A file that is not a database or is damaged is moved aside, under its name with
     * ".corrupt-<epoch seconds>" appended, and a new one is started: nothing is deleted. The whole
     * file is checked when a process opens it first, and again after any sign of damage. A file
     * written by a newer version is refused. One that may only be read can still be queried.
     * @param owner Name of the owner of the tables.
     * @param migrations SQL scripts; each one's place in the list never changes.
     */
    bool open(std::string_view owner, const std::vector<std::string>& migrations);

    /**
     * @brief Stops waiting for the disk, at a commit and at the end of the object.
     *
     * A killed process still loses nothing; a power cut may lose the last transactions.
     */
    bool relax();

    /** True between a successful open() and the end of the object. */
    bool isOpen() const { return _database != nullptr; }
    const std::string& path() const { return _path; }
    /** Where a damaged file was moved by the last open(), or empty. */
    const std::string& quarantinePath() const { return _quarantinePath; }
    /** The reason of the last failure, for a log line. */
    std::string lastError() const;

    /** Prepares a statement; a failed one answers every call with failure. */
    SqliteStatement prepare(std::string_view sql);
    /** Runs a script. */
    bool execute(const std::string& sql);
    /** Runs `body` in one immediate transaction; commits when it returns true. */
    bool transaction(const std::function<bool()>& body);
    std::int64_t lastInsertId() const;
    /** Rows that the last statement has inserted, changed or deleted. */
    std::int64_t changes() const;

private:
    struct Closer {
        void operator()(sqlite3* database) const;
    };
    enum class Health { Good, Damaged, Unknown };
    bool openFile();
    bool openImmutable();
    bool connect(const std::string& name, int flags);
    bool prepareConnection();
    Health checkIntegrity();
    bool isTrusted() const;
    bool readVersion(std::string_view owner, int& version);
    bool migrate(std::string_view owner, const std::vector<std::string>& migrations);
    bool applyMigrations(std::string_view owner, const std::vector<std::string>& migrations);
    bool quarantine();
    bool fail(const std::string& reason);
    bool failWithSqliteError();

    std::string _path;
    std::uint64_t _fileNumber = 0;
    int _busyTimeoutMs;
    std::unique_ptr<sqlite3, Closer> _database;
    std::string _quarantinePath;
    std::shared_ptr<std::string> _error = std::make_shared<std::string>();
};

} // namespace base
