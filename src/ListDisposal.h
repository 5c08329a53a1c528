// Deletes long lists without holding up the main loop.
#pragma once

#include <vector>

#include <Elementary.h>

/** A list of thousands of rows takes longer to delete than a person waits for a key press. */
class ListDisposal {
public:
    ListDisposal() = default;
    /** Deletes at once what is left. */
    ~ListDisposal();
    ListDisposal(const ListDisposal&) = delete;
    ListDisposal& operator=(const ListDisposal&) = delete;

    /** Hides a list that is part of nothing any more, and deletes it bit by bit. */
    void add(Evas_Object* genlist);

private:
    static Eina_Bool _nextRowsCb(void* data);
    static void _genlistDeletedCb(void* data, Evas* evas, Evas_Object* genlist, void* info);

    void stopTimer();
    void deleteSomeRows();

    std::vector<Evas_Object*> _lists;
    Ecore_Timer* _timer = nullptr;
};
