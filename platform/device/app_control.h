/**
 * @file
 * @brief Starting other applications and answering them.
 *
 * A request names an application and carries texts under keys. The started application answers with
 * a reply of the same form. Replies arrive on the main loop; every request that was sent with a
 * reply callback gets exactly one, also when the application cannot answer any more.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** A request or a reply. */
typedef struct app_control_s* app_control_h;

/** Results of the functions below. */
typedef enum {
    APP_CONTROL_ERROR_NONE = 0,
    APP_CONTROL_ERROR_IO = -5,                 /**< The other application cannot be reached. */
    APP_CONTROL_ERROR_OUT_OF_MEMORY = -12,     /**< No memory is left. */
    APP_CONTROL_ERROR_INVALID_PARAMETER = -22, /**< A null argument or a text that is too long. */
    APP_CONTROL_ERROR_APP_NOT_FOUND = -2,      /**< No application has this id. */
    APP_CONTROL_ERROR_KEY_NOT_FOUND = -126,    /**< No text is stored under this key. */
} app_control_error_e;

/** What is asked for when nothing particular is. */
#define APP_CONTROL_OPERATION_DEFAULT "http://vendra.com/appcontrol/operation/default"

/** How an application is shown. */
typedef enum {
    APP_CONTROL_LAUNCH_MODE_SINGLE = 0, /**< On its own. */
    APP_CONTROL_LAUNCH_MODE_GROUP = 1,  /**< On top of the application that asks for it. */
} app_control_launch_mode_e;

/** What became of a request. */
typedef enum {
    APP_CONTROL_RESULT_SUCCEEDED = 0,
    APP_CONTROL_RESULT_FAILED = -1,   /**< The application ended or broke the protocol. */
    APP_CONTROL_RESULT_CANCELED = -2, /**< The person left it without an answer. */
} app_control_result_e;

/**
 * @brief Receives the answer to a request.
 * @param request What was sent; valid during the call only.
 * @param reply The answer, without texts unless the application gave some; valid during the call
 * only.
 * @param data The pointer given to app_control_send_launch_request().
 */
typedef void (*app_control_reply_cb)(app_control_h request, app_control_h reply,
                                     app_control_result_e result, void* data);

/** @brief Makes an empty request or reply. @param[out] app_control To be destroyed. */
DEVICE_API int app_control_create(app_control_h* app_control);

/** @brief Frees a request or reply; one that was sent may be freed at once. */
DEVICE_API int app_control_destroy(app_control_h app_control);

/** @brief Names the application that is to be started. */
DEVICE_API int app_control_set_app_id(app_control_h app_control, const char* app_id);

/** @brief Names what is asked for, as a URI. */
DEVICE_API int app_control_set_operation(app_control_h app_control, const char* operation);

/** @brief Chooses how the application is shown; on its own unless set. */
DEVICE_API int app_control_set_launch_mode(app_control_h app_control,
                                           app_control_launch_mode_e mode);

/** @brief Stores a text under a key, over the one that was there. */
DEVICE_API int app_control_add_extra_data(app_control_h app_control, const char* key,
                                          const char* value);

/**
 * @brief Reads the text of a key.
 * @param[out] value To be freed with free(); untouched on failure.
 */
DEVICE_API int app_control_get_extra_data(app_control_h app_control, const char* key, char** value);

/**
 * @brief Starts the application of a request; returns without waiting for it.
 * @param callback Gets the answer; null when none is wanted.
 * @param data Passed to the callback; not owned.
 */
DEVICE_API int app_control_send_launch_request(app_control_h request, app_control_reply_cb callback,
                                               void* data);

/**
 * @brief Answers the request that started this application.
 * @param reply The texts of the answer.
 * @param request The request that is answered; a second answer fails.
 */
DEVICE_API int app_control_reply_to_launch_request(app_control_h reply, app_control_h request,
                                                   app_control_result_e result);

DEVICE_EXTERN_C_END
