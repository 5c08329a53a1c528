#include "screens/VolumeFixture.h"

#include <cstdlib>

namespace {

// The toolkit knows these from the X server, which the tests do without.
constexpr Ecore_X_Atom PANEL_STATE = 1001;
constexpr Ecore_X_Atom PANEL_ON = 1002;
constexpr Ecore_X_Atom PANEL_OFF = 1003;

Eina_Bool countCb(void* count, int, void*) {
    ++*static_cast<int*>(count);
    return ECORE_CALLBACK_PASS_ON;
}

} // namespace

void VolumeFixture::SetUp() {
    EditorFixture::SetUp();
    if (ECORE_X_EVENT_CLIENT_MESSAGE == 0)
        ECORE_X_EVENT_CLIENT_MESSAGE = ecore_event_type_new();
    ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE = PANEL_STATE;
    ECORE_X_ATOM_E_ILLUME_QUICKPANEL_ON = PANEL_ON;
    ECORE_X_ATOM_E_ILLUME_QUICKPANEL_OFF = PANEL_OFF;
}

void VolumeFixture::TearDown() {
    takeStageDown();
    EXPECT_TRUE(soundDevice().players().empty()) << "a preview outlived its editor";
    EXPECT_TRUE(soundDevice().grabbedKeys().empty()) << "a key outlived its editor";
    EditorFixture::TearDown();
}

void VolumeFixture::openWith(int level, int type) {
    constexpr int HOUR = 6;
    constexpr int MINUTE = 30;
    ClockAlarmDbData alarm = storedAlarm(HOUR, MINUTE);
    alarm.type = type;
    alarm.volume = level;
    editAlarm(alarm);
    errorLines();
    device().clearCalls();
}

AlarmVolumeItem* VolumeFixture::volumeRow() {
    return rowOf<AlarmVolumeItem>();
}

Evas_Object* VolumeFixture::slider() {
    stage().showRow(volumeRow()->getElmObjectItem());
    return volumeRow()->getSliderObj();
}

double VolumeFixture::shown() {
    // Without scrolling to it, which takes time.
    return elm_slider_value_get(volumeRow()->getSliderObj());
}

int VolumeFixture::savedLevel() {
    tapDone();
    const auto alarms = storedAlarms();
    EXPECT_EQ(alarms.size(), 1U);
    return alarms.empty() ? -1 : alarms.front().volume;
}

void VolumeFixture::quickPanel(bool open) {
    clientMessage(PANEL_STATE, open ? PANEL_ON : PANEL_OFF);
}

void VolumeFixture::clientMessage(Ecore_X_Atom type, Ecore_X_Atom word) {
    auto* message = static_cast<Ecore_X_Event_Client_Message*>(
        std::calloc(1, sizeof(Ecore_X_Event_Client_Message)));
    message->message_type = type;
    message->format = 32;
    message->data.l[0] = static_cast<long>(word);
    ecore_event_add(ECORE_X_EVENT_CLIENT_MESSAGE, message, nullptr, nullptr);
    Stage::frames(1);
}

LastKeyHandler::LastKeyHandler()
    : _down(ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, countCb, &pressed)),
      _up(ecore_event_handler_add(ECORE_EVENT_KEY_UP, countCb, &released)) {}

LastKeyHandler::~LastKeyHandler() {
    ecore_event_handler_del(_down);
    ecore_event_handler_del(_up);
}
