/**
 * @file
 * @brief The alarm editor's row for the volume.
 */
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"
#include "LiveWidgets.h"

class ClockSoundPlayer;

/** @brief A slider with an icon; a change is heard at once as a preview of the tone. */
class CLOCK_UI_EXPORT AlarmVolumeItem : public app_assist::WGenlistItem {
public:
    /** @param alarm The editor's working record; must outlive the row. */
    explicit AlarmVolumeItem(ClockAlarmDbData& alarm);
    /** @brief Ends the preview. */
    ~AlarmVolumeItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;
    /** @brief Names the row for screen readers. */
    void onSetElmObjectItem(Elm_Object_Item* item) override;

    /** @brief Sets what a tap does. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);
    /** @brief The slider; null while the row has none. */
    Evas_Object* getSliderObj() const;
    /** @brief Moves the slider, if there is one; stores and plays nothing. */
    void moveSlider(double value);
    /** @brief Ends the preview, if there is one. */
    void stopSound();
    /**
     * @brief Stores a level that was set elsewhere; moves and plays nothing.
     *
     * Refused while the stored level is out of range; the new one is not examined.
     */
    void setVolume(int volume);
    /** @brief One step louder, heard at once; nothing at the loudest. */
    void increaseVolume();
    /** @brief One step quieter, heard at once; nothing at the quietest. */
    void decreaseVolume();
    /**
     * @brief Shows the icon of the present level and alert type.
     * @param parent Parent of the image; null = the slider.
     */
    void _updateVolumeIcon(Evas_Object* parent);

    /** @name Callbacks of the list and of the slider; data is the row.
     *  @{ */
    static Evas_Object* _getVolumeItemContent(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _keepVolumeItemContent(void* data, Evas_Object* genlist, const char* part,
                                               Evas_Object* old);
    static void _volumeSliderChangeCb(void* data, Evas_Object* slider, void* info);
    static void _volumeSliderStopCb(void* data, Evas_Object* slider, void* info);
    static void _volumeSliderUnfocusedCb(void* data, Evas_Object* slider, void* info);
    /** @} */

private:
    Evas_Object* createSlider(Evas_Object* genlist);
    static void _languageChangedCb(void* data, Evas_Object* slider, void* info);
    void nameSliders();
    void step(std::optional<std::int32_t> level);
    void _updatePlayerSound();
    void _updateVolumeIconAndPlayer();

    ClockAlarmDbData& _alarm;
    std::function<void()> _selected;
    std::unique_ptr<ClockSoundPlayer> _player;
    LiveWidgets _sliders;
    Evas_Object* _parent = nullptr;
};
