#include <cstdlib>
#include <string>

#include <gtest/gtest.h>

#include "Helper.h"
#include "device/app_resource_manager.h"

namespace {

constexpr const char* themeName = "edje/Some.edj";

class AppResourceManager : public testing::Test {
public:
    ~AppResourceManager() override {
        while (app_resource_manager_release() == APP_RESOURCE_ERROR_NONE) {
        }
    }

protected:
    AppResourceManager() { writeFile(host.resourceDir() + "/" + themeName, "theme"); }

    /** What a look-up returns; a path that it gives goes to `path`. */
    int look(const char* id) {
        char* found = const_cast<char*>("untouched");
        const int result = app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, id, &found);
        path = found ? found : "";
        std::free(found);
        return result;
    }

    std::string path;
    DeviceHost host;
};

} // namespace

TEST_F(AppResourceManager, FindsAResourceByItsRelativeName) {
    app_resource_manager_init();
    EXPECT_EQ(look(themeName), APP_RESOURCE_ERROR_NONE);
    EXPECT_EQ(path, host.resourceDir() + "/" + themeName);
}

TEST_F(AppResourceManager, WhatIsMissingOrNoFileIsNotFound) {
    app_resource_manager_init();
    EXPECT_EQ(look("edje/Other.edj"), APP_RESOURCE_ERROR_NOT_FOUND);
    EXPECT_EQ(path, "") << "the path is set to null";
    EXPECT_EQ(look("edje"), APP_RESOURCE_ERROR_NOT_FOUND);
}

TEST_F(AppResourceManager, FindsNothingBeforeItIsInitialisedAndAfterItIsReleased) {
    EXPECT_EQ(look(themeName), APP_RESOURCE_ERROR_NOT_FOUND);
    app_resource_manager_init();
    app_resource_manager_release();
    EXPECT_EQ(look(themeName), APP_RESOURCE_ERROR_NOT_FOUND);
}

TEST_F(AppResourceManager, EveryInitialisationIsReleasedByItself) {
    app_resource_manager_init();
    app_resource_manager_init();
    EXPECT_EQ(app_resource_manager_release(), APP_RESOURCE_ERROR_NONE);
    EXPECT_EQ(look(themeName), APP_RESOURCE_ERROR_NONE) << "one user is left";
    EXPECT_EQ(app_resource_manager_release(), APP_RESOURCE_ERROR_NONE);
    EXPECT_EQ(app_resource_manager_release(), APP_RESOURCE_ERROR_NOT_FOUND);
    app_resource_manager_init();
    EXPECT_EQ(look(themeName), APP_RESOURCE_ERROR_NONE)
        << "one release too many takes nothing away";
}

TEST_F(AppResourceManager, NamesThatLeaveTheResourcesAreRefused) {
    app_resource_manager_init();
    writeFile(host.dataDir() + "/precious", "data");
    const std::string absolute = host.resourceDir() + "/" + themeName;
    for (const char* id : {"", absolute.c_str(), "../data/precious", "edje/../edje/Some.edj",
                           static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(look(id), APP_RESOURCE_ERROR_INVALID_PARAMETER) << (id ? id : "(null)");
        EXPECT_EQ(path, "");
    }
}

TEST_F(AppResourceManager, UnknownKindsAndNullPathsAreRefused) {
    app_resource_manager_init();
    char* found = nullptr;
    EXPECT_EQ(app_resource_manager_get(static_cast<app_resource_e>(9), themeName, &found),
              APP_RESOURCE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, themeName, nullptr),
              APP_RESOURCE_ERROR_INVALID_PARAMETER);
}
