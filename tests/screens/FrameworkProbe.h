/**
 * @file
 * @brief Pages and popups that write down what the framework does with them.
 */
#pragma once

#include <functional>
#include <string>
#include <vector>

#include <Elementary.h>
#include <app_assist/WContentViewController.h>
#include <app_assist/WNaviframeController.h>
#include <app_assist/WPopupController.h>

/** What happened, in order; outlives everything that writes to it. */
using Trace = std::vector<std::string>;

/** Each step goes to the trace as "<name> <step>" and then runs the action set for it, if any. */
class Probe {
public:
    Probe(Trace& trace, std::string name) : _trace(trace), _name(std::move(name)) {}
    /** Runs an action whenever a step happens. */
    void on(const std::string& step, std::function<void()> action) {
        _actions.emplace_back(step, std::move(action));
    }
    void note(const std::string& step) {
        _trace.push_back(_name + " " + step);
        for (const auto& [name, action] : _actions) {
            if (name == step) {
                action();
            }
        }
    }
    const std::string& name() const { return _name; }

private:
    Trace& _trace;
    std::string _name;
    std::vector<std::pair<std::string, std::function<void()>>> _actions;
};

/** A page with a button in its middle. */
class ProbePage : public app_assist::WContentViewController {
public:
    ProbePage(Trace& trace, const std::string& name) : probe(trace, name) {}
    ~ProbePage() override { probe.note("gone"); }

    const char* getClassName() const override { return "ProbePage"; }

    void onSetContainerProperties(app_assist::WNaviframeController* naviframeController,
                                  Elm_Object_Item* naviItem) override {
        container = naviframeController;
        itemWhenPushed = naviItem;
        probe.note("container");
    }
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override {
        probe.note("push");
        return failPush ? nullptr : WContentViewController::onPushToNaviframe(naviframe);
    }
    void onPushed(Elm_Object_Item* naviItem) override {
        itemWhenPushed = naviItem;
        probe.note("pushed");
    }
    bool onPop() override {
        probe.note("asked");
        return letGo;
    }
    /** For a page whose view is deleted after its own part of the destructor. */
    void forgetView() {
        evas_object_event_callback_del(getEvasObj(), EVAS_CALLBACK_DEL, viewDeletedCb);
    }
    void onBecomeTop() override { probe.note("top"); }
    void onSetAsPageContent(Evas_Object* object) override {
        content = object;
        probe.note("content");
    }

    Probe probe;
    bool letGo = true;
    bool failCreate = false;
    bool failView = false;
    bool failPush = false;
    Evas_Object* button = nullptr;
    Evas_Object* content = nullptr;
    Evas_Object* parent = nullptr;
    void* param = nullptr;
    app_assist::WNaviframeController* container = nullptr;
    Elm_Object_Item* itemWhenPushed = nullptr;

protected:
    bool onCreate(void* /*param*/) override {
        probe.note("create");
        return !failCreate;
    }
    Evas_Object* onCreateView(Evas_Object* viewParent, void* viewParam) override {
        parent = viewParent;
        param = viewParam;
        probe.note("view");
        if (failView) {
            return nullptr;
        }
        Evas_Object* const box = elm_box_add(viewParent);
        button = elm_button_add(box);
        elm_object_text_set(button, probe.name().c_str());
        evas_object_size_hint_min_set(button, 160, 60);
        evas_object_smart_callback_add(button, "clicked", clickedCb, this);
        elm_box_pack_end(box, button);
        evas_object_show(button);
        evas_object_event_callback_add(box, EVAS_CALLBACK_DEL, viewDeletedCb, this);
        return box;
    }
    void onCreated() override { probe.note("created"); }
    void onDestroy() override {
        probe.note(getEvasObj() == nullptr ? "destroyed without view" : "destroyed");
    }

private:
    static void clickedCb(void* data, Evas_Object* /*button*/, void* /*info*/) {
        static_cast<ProbePage*>(data)->probe.note("clicked");
    }
    static void viewDeletedCb(void* data, Evas* /*canvas*/, Evas_Object* /*view*/, void* /*info*/) {
        static_cast<ProbePage*>(data)->probe.note("view deleted");
    }
};

/** A popup with a label. */
class ProbePopup : public app_assist::WPopupController {
public:
    ProbePopup(Trace& trace, const std::string& name) : probe(trace, name) {}
    ~ProbePopup() override { probe.note("gone"); }

    const char* getClassName() const override { return "ProbePopup"; }

    Probe probe;
    bool failView = false;

protected:
    bool onCreate(void* /*param*/) override {
        probe.note("create");
        return true;
    }
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override {
        probe.note("view");
        if (failView) {
            return nullptr;
        }
        Evas_Object* const popup = WPopupController::onCreateView(parent, param);
        evas_object_event_callback_add(popup, EVAS_CALLBACK_DEL, viewDeletedCb, this);
        return popup;
    }
    void onCreated() override { probe.note("created"); }
    void onDestroy() override {
        probe.note(getEvasObj() == nullptr ? "destroyed without view" : "destroyed");
        WPopupController::onDestroy();
    }

private:
    static void viewDeletedCb(void* data, Evas* /*canvas*/, Evas_Object* /*view*/, void* /*info*/) {
        static_cast<ProbePopup*>(data)->probe.note("view deleted");
    }
};
