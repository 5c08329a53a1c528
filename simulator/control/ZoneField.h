/**
 * @file
 * @brief A field for a time zone, with names that fit below it.
 */
#pragma once

#include <functional>
#include <string>

#include <Evas.h>

namespace simulator::control {

/** @brief Choosing a time zone: by its name, by the return key for the first that fits, or by
 * pressing a name of the list. It must go before its row. */
class ZoneField {
public:
    /** @param chosen Gets the name; or what was typed, when no zone fits. */
    ZoneField(Evas_Object* row, std::function<void(const std::string& zone)> chosen);
    ~ZoneField();
    ZoneField(const ZoneField&) = delete;
    ZoneField& operator=(const ZoneField&) = delete;

    /** @brief Shows the zone in force, unless somebody is typing. */
    void show(const std::string& zone);

private:
    static void _typedCb(void* data, Evas_Object* field, void* info);
    static void _activatedCb(void* data, Evas_Object* field, void* info);
    static void _unfocusedCb(void* data, Evas_Object* field, void* info);
    void suggest();
    void choose(std::string zone);
    void closeList();

    Evas_Object* _field;
    Evas_Object* _list = nullptr; ///< Null while nothing is suggested.
    std::function<void(const std::string&)> _chosen;
};

} // namespace simulator::control
