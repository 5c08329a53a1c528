/**
 * @file
 * @brief The panel's log: toasts and log lines as they come.
 */
#pragma once

#include <memory>

#include <Ecore.h>
#include <Evas.h>

#include "LogLines.h"

namespace simulator::control {

/** @brief Shows the lines of this process's log and follows its end. */
class LogSection {
public:
    LogSection(Evas_Object* column, std::shared_ptr<const LogLines> lines);
    LogSection(const LogSection&) = delete;
    LogSection& operator=(const LogSection&) = delete;

    /** @brief Shows lines that have come since. */
    void refresh();

private:
    struct JobDeleter {
        void operator()(Ecore_Job* job) const { ecore_job_del(job); }
    };
    static void _toEndCb(void* data);
    bool showsEnd() const;

    std::shared_ptr<const LogLines> _lines;
    std::size_t _shown = 0;
    Evas_Object* _scroller;
    Evas_Object* _text;
    std::unique_ptr<Ecore_Job, JobDeleter> _toEnd;
};

} // namespace simulator::control
