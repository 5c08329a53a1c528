/**
 * @file
 * @brief A page for what is tested to lie over.
 */
#pragma once

#include <Elementary.h>

#include <app_assist/WContentViewController.h>

/** Stays, and counts the requests to leave it: those that nothing nearer took. */
class PageBelow : public app_assist::WContentViewController {
public:
    bool onPop() override {
        ++pops;
        return false;
    }
    int pops = 0;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void*) override {
        Evas_Object* const label = elm_label_add(parent);
        elm_object_text_set(label, "Page below");
        return label;
    }
};
