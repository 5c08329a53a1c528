/**
 * @file
 * @brief The alarm editor with its volume row, the hardware keys and the quick panel.
 */
#pragma once

#include <optional>
#include <string>
#include <vector>

#include <Ecore.h>
#include <Ecore_X.h>

#include "AlarmVolumeItem.h"
#include "screens/EditorFixture.h"
#include "screens/SliderHand.h"
#include "support/SoundFake.h"

constexpr const char* RAISE = "XF86AudioRaiseVolume";
constexpr const char* LOWER = "XF86AudioLowerVolume";

class VolumeFixture : public EditorFixture {
protected:
    void SetUp() override;
    void TearDown() override;

    /** Opens an alarm of some level and type. */
    void openWith(int level, int type = 0);

    /** The volume row; null while there is none. */
    AlarmVolumeItem* volumeRow();
    /** Its slider, scrolled into view. */
    Evas_Object* slider();
    /** What the slider shows. */
    double shown();
    /** Presses Done. @return The level that was stored. */
    int savedLevel();
    SliderHand& hand() { return _hand ? *_hand : _hand.emplace(stage()); }

    /** Opens or closes the quick panel. */
    void quickPanel(bool open);
    /** Sends the editor's window some client message. */
    static void clientMessage(Ecore_X_Atom type, Ecore_X_Atom word);

    static std::size_t previewsBegun() {
        return device().callsTo("ClockSoundPlayer::initialize").size();
    }

private:
    std::optional<SliderHand> _hand;
};

/** Counts the key events that reach the handler that was added last. */
class LastKeyHandler {
public:
    LastKeyHandler();
    ~LastKeyHandler();
    LastKeyHandler(const LastKeyHandler&) = delete;
    LastKeyHandler& operator=(const LastKeyHandler&) = delete;
    int pressed = 0;
    int released = 0;

private:
    Ecore_Event_Handler* _down;
    Ecore_Event_Handler* _up;
};
