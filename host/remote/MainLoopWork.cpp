#include "MainLoopWork.h"

#include <Ecore.h>

namespace host {

namespace {

Turns turns;
Ecore_Select_Function originalSelect = nullptr;

int countingSelect(int count, fd_set* readable, fd_set* writable, fd_set* failed,
                   struct timeval* timeout) {
    ++turns.all;
    if (timeout && timeout->tv_sec == 0 && timeout->tv_usec == 0)
        ++turns.busy;
    return originalSelect(count, readable, writable, failed, timeout);
}

} // namespace

void countTurns() {
    if (originalSelect)
        return;
    originalSelect = ecore_main_loop_select_func_get();
    ecore_main_loop_select_func_set(countingSelect);
}

void noteOwnTurn() {
    ++turns.own;
}

Turns turnsSoFar() {
    return turns;
}

} // namespace host
