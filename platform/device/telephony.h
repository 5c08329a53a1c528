/**
 * @file
 * @brief The mobile network.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Connection to the telephony service through one modem. */
typedef struct tel_handle_s* tel_handle_h;

/** Result of a successful call; every failure is a negative number. */
#define TEL_ERROR_NONE 0
/** A null argument or an unknown property. */
#define TEL_ERROR_INVALID_PARAMETER (-1)
/** The service or the modem cannot be reached, or does not know. */
#define TEL_ERROR_OPERATION_FAILED (-2)

/** Mobile country code and network code of the network, for example "26201". */
#define TEL_PROPERTY_NETWORK_PLMN "org.nimbo.telephony.Network:plmn"

/**
 * @brief The names of the modems.
 * @return Null-terminated vector to be freed with g_strfreev(); null when the service is not there.
 */
DEVICE_API char** tel_get_cp_name_list(void);

/**
 * @brief Connects to a modem.
 * @param cp_name Its name; null for the first one.
 * @return Handle to be freed with tel_deinit(), or null.
 */
DEVICE_API tel_handle_h tel_init(const char* cp_name);

/**
 * @brief Reads a property of the modem's network.
 * @param[out] value Text to be freed with free(), empty when there is no network; untouched on
 * failure.
 */
DEVICE_API int tel_get_property_string(tel_handle_h handle, const char* property, char** value);

/** @brief Ends a connection; null is allowed. */
DEVICE_API int tel_deinit(tel_handle_h handle);

DEVICE_EXTERN_C_END
