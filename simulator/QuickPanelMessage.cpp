#include "QuickPanelMessage.h"

#include <cstdlib>

#include <Ecore.h>
#include <Ecore_X.h>
#include <Elementary.h>

namespace simulator {
namespace {

/** Any numbers that differ. */
constexpr Ecore_X_Atom STATE = 1;
constexpr Ecore_X_Atom ON = 2;
constexpr Ecore_X_Atom OFF = 3;
constexpr int LONGS = 32;

void sendWithoutDisplay(Ecore_X_Atom state) {
    // The main loop frees it.
    auto* message = static_cast<Ecore_X_Event_Client_Message*>(
        std::calloc(1, sizeof(Ecore_X_Event_Client_Message)));
    if (message == nullptr)
        return;
    message->message_type = ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE;
    message->format = LONGS;
    message->data.l[0] = static_cast<long>(state);
    ecore_event_add(ECORE_X_EVENT_CLIENT_MESSAGE, message, nullptr, nullptr);
}

} // namespace

void prepareQuickPanelMessage() {
    // The toolkit learns all of these from the X server, and only then.
    if (ECORE_X_EVENT_CLIENT_MESSAGE == 0)
        ECORE_X_EVENT_CLIENT_MESSAGE = ecore_event_type_new();
    if (ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE != 0)
        return;
    ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE = STATE;
    ECORE_X_ATOM_E_ILLUME_QUICKPANEL_ON = ON;
    ECORE_X_ATOM_E_ILLUME_QUICKPANEL_OFF = OFF;
}

void sendQuickPanelMessage(Evas_Object* window, bool shown) {
    const Ecore_X_Atom state =
        shown ? ECORE_X_ATOM_E_ILLUME_QUICKPANEL_ON : ECORE_X_ATOM_E_ILLUME_QUICKPANEL_OFF;
    if (const Ecore_X_Window xWindow = elm_win_xwindow_get(window); xWindow != 0)
        ecore_x_client_message32_send(xWindow, ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE,
                                      ECORE_X_EVENT_MASK_NONE, static_cast<long>(state), 0, 0, 0,
                                      0);
    else
        sendWithoutDisplay(state);
}

} // namespace simulator
