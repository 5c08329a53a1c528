#define LOG_TAG "WORLDCLOCK"
#include "WorldClockAddCityViewController.h"

#include <utility>

#include <Ecore_IMF.h>

#include <app_assist/WAccessible.h>
#include <app_assist/WNaviframeController.h>
#include <base/Log.h>
#include <base/Text.h>
#include <clock/ClockText.h>
#include <clock/ClockWorldClockDbModel.h>
#include <device/app_resource_manager.h>
#include <device/feedback.h>
#include <device/i18n.h>
#include <device/notification.h>
#include <device/uxt.h>

#include "CityRows.h"
#include "ListDisposal.h"
#include "NullData.h"
#include "ThemePath.h"
#include "WorldClockAddCityItem.h"
#include "rules/CityOrder.h"
#include "rules/CitySearch.h"

namespace {

constexpr int MAX_SEARCH_CHARACTERS = 20;
constexpr std::size_t MAX_GUIDE_BYTES = 127;
constexpr std::size_t MAX_TOAST_BYTES = 1023;
constexpr const char* FALLBACK_LOCALE = "en_GB.UTF-8";
// The magnifier of the device's symbol font.
constexpr const char* SEARCH_GLYPH = "\xEF\xA2\x97";

// Entries keep a pointer to it.
Elm_Entry_Filter_Limit_Size searchLimit = {MAX_SEARCH_CHARACTERS, 0};

// One for all pickers; only one is open at a time.
i18n_ucollator_h cityCollator = nullptr;

void dropCityCollator() {
    i18n_ucollator_destroy(std::exchange(cityCollator, nullptr));
}

} // namespace

WorldClockAddCityViewController::WorldClockAddCityViewController(int position)
    : _newCityPosition(position) {
    prepare();
}

WorldClockAddCityViewController::WorldClockAddCityViewController(
    WorldClockAddCityCallerType callerType, app_control_s* request)
    : _callerType(callerType), _appControl(request) {
    prepare();
}

void WorldClockAddCityViewController::prepare() {
    const char* locale = nullptr;
    if (i18n_ulocale_get_default(&locale) > I18N_ERROR_NONE || !locale)
        locale = FALLBACK_LOCALE;
    dropCityCollator();
    if (i18n_ucollator_create(locale, &cityCollator) > I18N_ERROR_NONE)
        LOG_ERROR("ucollator create failed, do not sort");
    feedback_initialize();
    // A search is prepared before the first key press asks for it.
    _rows = std::make_unique<CityRows>([this] { citySearch(); });
    _oldLists = std::make_unique<ListDisposal>();
}

WorldClockAddCityViewController::~WorldClockAddCityViewController() {
    if (_genlist)
        evas_object_event_callback_del_full(_genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    _rows.reset();
    _cityItem.reset();
    _cityList.clear();
    dropCityCollator();
}

void WorldClockAddCityViewController::setCityDataReturnFunc(
    const std::function<void(ClockWorldClockDbData&)>& func) {
    _cityDataReturnFunc = func;
}

const char* WorldClockAddCityViewController::getClassName() const {
    return "WorldClockAddCityViewController";
}

Evas_Object* WorldClockAddCityViewController::onCreateView(Evas_Object* parent, void*) {
    Evas_Object* outer = addLayout(parent, "layout", "application", "default");
    evas_object_size_hint_weight_set(outer, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    Evas_Object* base = addLayout(outer, "layout", "application", "searchbar_base");
    elm_layout_signal_emit(base, "elm,state,show,searchbar", "elm");
    evas_object_size_hint_weight_set(base, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_object_part_content_set(outer, "elm.swallow.content", base);
    _fastscrollLayout = addLayout(base, "layout", "application", "fastscroll");
    elm_object_part_content_set(base, "elm.swallow.content", _fastscrollLayout);
    _createSearchBar(base);
    _createIndex(_fastscrollLayout);
    _createGenlist(_fastscrollLayout);
    loadCities();
    return outer;
}

Evas_Object* WorldClockAddCityViewController::addLayout(Evas_Object* parent, const char* theme,
                                                        const char* group, const char* style) {
    Evas_Object* layout = elm_layout_add(parent);
    elm_layout_theme_set(layout, theme, group, style);
    evas_object_show(layout);
    return layout;
}

void WorldClockAddCityViewController::_createSearchBar(Evas_Object* parent) {
    if (!parent) {
        LOG_ERROR("parent is nullptr");
        return;
    }
    app_resource_manager_init();
    const std::string theme = themePath("edje/WorldClockAddCityViewController.edj", LOG_TAG);
    app_resource_manager_release();
    Evas_Object* layout = elm_layout_add(parent);
    elm_layout_file_set(layout, theme.c_str(), "searchbar.layout");
    elm_object_part_content_set(parent, "searchbar", layout);
    evas_object_show(layout);
    createSearchEntry(layout);
    setGuideText();
    Evas_Object* location = elm_button_add(layout);
    elm_object_part_content_set(layout, "location.btn", location);
    elm_object_style_set(location, "bg_animated");
    app_assist::setAccessibleTextId(location, "IDS_ACC_BODY_LOCATION");
    evas_object_smart_callback_add(location, "clicked", _locationBtnClickedCb, this);
}

void WorldClockAddCityViewController::createSearchEntry(Evas_Object* layout) {
    _editField = uxt_edit_field_layout_add(layout, UXT_EDIT_FIELD_SEARCH);
    evas_object_size_hint_weight_set(_editField, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(_editField, EVAS_HINT_FILL, EVAS_HINT_FILL);
    uxt_edit_field_set_clear_button_enabled(_editField, EINA_TRUE);
    elm_object_part_content_set(layout, "entry.part", _editField);
    _searchEntry = uxt_edit_field_layout_get_entry(_editField);
    elm_entry_cnp_mode_set(_searchEntry, ELM_CNP_MODE_PLAINTEXT);
    elm_entry_input_panel_return_key_type_set(_searchEntry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_SEARCH);
    elm_entry_markup_filter_append(_searchEntry, elm_entry_filter_limit_size, &searchLimit);
    evas_object_smart_callback_add(_searchEntry, "changed", _searchEntryChangedCb, this);
    evas_object_smart_callback_add(_searchEntry, "preedit,changed", _searchEntryChangedCb, this);
    evas_object_smart_callback_add(_searchEntry, "activated", _searchIconActivatedCb, this);
    evas_object_smart_callback_add(_searchEntry, "maxlength,reached",
                                   _searchEntryMaxLengthReachtedCb, nullptr);
}

void WorldClockAddCityViewController::setGuideText() {
    const std::string guide = std::string(SEARCH_GLYPH) + " " + clockText("IDS_COM_BODY_SEARCH");
    app_assist::setAccessibleTextId(_searchEntry, "IDS_COM_BODY_SEARCH");
    elm_object_part_text_set(_searchEntry, "elm.guide",
                             std::string(base::cutUtf8(guide, MAX_GUIDE_BYTES)).c_str());
}

void WorldClockAddCityViewController::_createIndex(Evas_Object* parent) {
    _index = elm_index_add(parent);
    evas_object_size_hint_weight_set(_index, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(_index, EVAS_HINT_FILL, EVAS_HINT_FILL);
    elm_object_part_content_set(parent, "elm.swallow.fastscroll", _index);
    elm_index_autohide_disabled_set(_index, EINA_TRUE);
    // Its letters are hours from Greenwich.
    app_assist::setAccessibleName(_index, "GMT");
    evas_object_smart_callback_add(_index, "selected", _indexSelectedCb, this);
    evas_object_smart_callback_add(_index, "delay,changed", _indexChangedCb, this);
    evas_object_smart_callback_add(_index, "changed", _indexChangedCb, this);
    elm_index_level_go(_index, 0);
}

void WorldClockAddCityViewController::_createGenlist(Evas_Object* parent) {
    if (!parent) {
        LOG_ERROR("parent is nullptr");
        return;
    }
    _genlist = elm_genlist_add(parent);
    elm_scroller_policy_set(_genlist, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    elm_genlist_mode_set(_genlist, ELM_LIST_COMPRESS);
    elm_genlist_homogeneous_set(_genlist, EINA_TRUE);
    evas_object_size_hint_weight_set(_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
    elm_object_part_content_set(parent, "elm.swallow.content", _genlist);
    evas_object_smart_callback_add(_genlist, "selected", _genlistSelectedCb, this);
    evas_object_smart_callback_add(_genlist, "swipe", _genlistScrolledCb, this);
    evas_object_event_callback_add(_genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    evas_object_show(_genlist);
}

void WorldClockAddCityViewController::_genlistDeletedCb(void* data, Evas*, Evas_Object* genlist,
                                                        void*) {
    auto* self = static_cast<WorldClockAddCityViewController*>(data);
    if (self->_genlist == genlist)
        self->_genlist = nullptr;
}

void WorldClockAddCityViewController::_hideKeypad() {
    if (!_searchEntry) {
        LOG_ERROR("entry is not created");
        return;
    }
    auto* context = static_cast<Ecore_IMF_Context*>(elm_entry_imf_context_get(_searchEntry));
    if (!context ||
        ecore_imf_context_input_panel_state_get(context) == ECORE_IMF_INPUT_PANEL_STATE_HIDE)
        return;
    LOG_ERROR("Hide keyboard");
    ecore_imf_context_reset(context);
    ecore_imf_context_input_panel_hide(context);
}

Elm_Object_Item* WorldClockAddCityViewController::onPushToNaviframe(Evas_Object* naviframe) {
    return elm_naviframe_item_push(naviframe, clockText("IDS_WCL_OPT_ADDCITY"), nullptr, nullptr,
                                   getEvasObj(), nullptr);
}

void WorldClockAddCityViewController::onPushed(Elm_Object_Item* naviItem) {
    Evas_Object* back = elm_button_add(getNaviframeController()->getEvasObj());
    elm_object_style_set(back, "naviframe/back_btn/default");
    elm_object_translatable_text_set(back, "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB");
    evas_object_smart_callback_add(back, "clicked", _backBtnClickedCb, this);
    elm_object_item_part_content_set(naviItem, "prev_btn", back);
    elm_object_item_translatable_part_text_set(naviItem, "elm.text.title", "IDS_WCL_OPT_ADDCITY");
}

void WorldClockAddCityViewController::_backBtnClickedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    static_cast<WorldClockAddCityViewController*>(data)->popOut();
}

void WorldClockAddCityViewController::onEvent(ClockEventListener::EventType event) {
    if (event != ClockEventListener::LANGUAGE_CHANGED)
        return;
    // Cities are found by the names that they have now.
    _search.reset();
    _shownText.reset();
    if (_searchEntry)
        setGuideText();
    if (getNaviItem())
        elm_object_item_translatable_part_text_set(getNaviItem(), "elm.text.title",
                                                   "IDS_WCL_OPT_ADDCITY");
}

void WorldClockAddCityViewController::_searchIconActivatedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    elm_object_focus_set(static_cast<WorldClockAddCityViewController*>(data)->_searchEntry,
                         EINA_FALSE);
}

void WorldClockAddCityViewController::_searchEntryMaxLengthReachtedCb(void*, Evas_Object*, void*) {
    const std::string text =
        base::formatTranslation(clockText("IDS_CLOCK_TPOP_CANT_ENTER_MORE_THAN_PD_CHARACTERS"),
                                {MAX_SEARCH_CHARACTERS}, MAX_TOAST_BYTES);
    notification_status_message_post(text.c_str());
}

void WorldClockAddCityViewController::_indexSelectedCb(void* data, Evas_Object*, void* item) {
    RETURN_IF_NULL(data);
    RETURN_IF_NULL(item);
    auto* self = static_cast<WorldClockAddCityViewController*>(data);
    auto* indexItem = static_cast<Elm_Object_Item*>(item);
    self->showIndexed(indexItem);
    elm_index_item_selected_set(indexItem, EINA_FALSE);
    self->_hideKeypad();
}

void WorldClockAddCityViewController::_indexChangedCb(void* data, Evas_Object*, void* item) {
    RETURN_IF_NULL(data);
    RETURN_IF_NULL(item);
    auto* self = static_cast<WorldClockAddCityViewController*>(data);
    self->showIndexed(static_cast<Elm_Object_Item*>(item));
    self->_hideKeypad();
}

void WorldClockAddCityViewController::showIndexed(Elm_Object_Item* indexItem) {
    if (!elm_object_item_data_get(indexItem))
        _rows->complete();
    if (auto* row = static_cast<Elm_Object_Item*>(elm_object_item_data_get(indexItem)))
        elm_genlist_item_show(row, ELM_GENLIST_ITEM_SCROLLTO_TOP);
}

void WorldClockAddCityViewController::_genlistScrolledCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    static_cast<WorldClockAddCityViewController*>(data)->_hideKeypad();
}

bool WorldClockAddCityViewController::_cityItemCompareByGmtOffset(const ClockWorldClockDbData& a,
                                                                  const ClockWorldClockDbData& b) {
    return rules::isNotAfterByGmtOffset(a, b, cityCollator);
}

bool WorldClockAddCityViewController::_cityItemCompareByName(const ClockWorldClockDbData& a,
                                                             const ClockWorldClockDbData& b) {
    return rules::isNotAfterByName(a, b, cityCollator);
}

void WorldClockAddCityViewController::loadCities() {
    ClockWorldClockDbModel model;
    model.getWorldClockAllCityList(_cityList);
    rules::sortCities(_cityList, cityCollator);
    _updateGenlist("");
}
