// The clock's store as tests look at it: from outside, and from processes that die.
#pragma once

#include <csignal>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <sqlite3.h>
#include <sys/wait.h>
#include <unistd.h>

#include "clock/ClockAlarmDbData.h"
#include "host/Helper.h"

// A connection that does not use the code under test.
class OutsideView {
public:
    explicit OutsideView(const std::string& path) { sqlite3_open(path.c_str(), &_database); }
    ~OutsideView() { sqlite3_close(_database); }
    OutsideView(const OutsideView&) = delete;
    OutsideView& operator=(const OutsideView&) = delete;

    // The rows of a query, columns joined with '|'; an error's message when it fails.
    std::vector<std::string> rows(const std::string& sql) {
        std::vector<std::string> result;
        char* error = nullptr;
        const auto collect = [](void* data, int count, char** values, char**) {
            std::string row;
            for (int i = 0; i < count; ++i)
                row += (i > 0 ? "|" : "") + std::string(values[i] ? values[i] : "NULL");
            static_cast<std::vector<std::string>*>(data)->push_back(row);
            return 0;
        };
        if (sqlite3_exec(_database, sql.c_str(), collect, &result, &error) != SQLITE_OK)
            result.emplace_back(error ? error : "failed");
        sqlite3_free(error);
        return result;
    }
    std::string value(const std::string& sql) {
        const auto all = rows(sql);
        return all.size() == 1 ? all[0] : "not one row";
    }

private:
    sqlite3* _database = nullptr;
};

// Runs a function in a process of its own. Returns what it returned, or -1 when it died.
inline int inAnotherProcess(const std::function<int()>& action) {
    const pid_t process = fork();
    if (process == 0)
        _exit(action());
    int status = 0;
    waitpid(process, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

// Another process that holds the write lock of a store for as long as the object lives.
class LockedStore {
public:
    explicit LockedStore(const std::string& path) {
        int ready[2];
        if (pipe(ready) != 0)
            std::abort();
        _process = fork();
        if (_process == 0) {
            OutsideView view(path);
            view.rows("BEGIN EXCLUSIVE");
            static_cast<void>(write(ready[1], "x", 1) == 1);
            for (;;)
                pause();
        }
        char byte = 0;
        static_cast<void>(read(ready[0], &byte, 1) == 1);
        close(ready[0]);
        close(ready[1]);
    }
    ~LockedStore() {
        kill(_process, SIGKILL);
        waitpid(_process, nullptr, 0);
    }
    LockedStore(const LockedStore&) = delete;
    LockedStore& operator=(const LockedStore&) = delete;

private:
    pid_t _process = -1;
};

// An alarm as the editor leaves it.
inline ClockAlarmDbData storableAlarm(int id, int hour = 7, int minute = 30, int weekdays = 0) {
    ClockAlarmDbData alarm;
    alarm.leading = 0;
    alarm.id = id;
    alarm.enable = 1;
    alarm.hour = hour;
    alarm.min = minute;
    alarm.repeatWeekly = weekdays;
    alarm.repeatOnce = weekdays == 0 ? 1 : 0;
    return alarm;
}
