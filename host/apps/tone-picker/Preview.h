/**
 * @file
 * @brief Lets a person hear a tone.
 */
#pragma once

#include <string>

#include <Ecore.h>

#include "device/sound_player.h"

namespace tone_picker {

/**
 * @brief Plays one tone at a time, as loud as an alarm; silent when it goes.
 *
 * The volume keys change the alarm's level meanwhile, as they do in the alarm editor.
 */
class Preview {
public:
    Preview();
    ~Preview();
    Preview(const Preview&) = delete;
    Preview& operator=(const Preview&) = delete;

    /** Plays a file once from its beginning, in place of the one that plays. */
    void play(const std::string& path);

private:
    static Eina_Bool _keyDownCb(void* data, int type, void* info);
    void changeLevel(int difference);

    sound_player_h _player = nullptr;
    Ecore_Event_Handler* _keys = nullptr;
};

} // namespace tone_picker
