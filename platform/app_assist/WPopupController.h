/**
 * @file
 * @brief A popup over another view.
 */
#pragma once

#include <functional>
#include <string>
#include <vector>

#include <app_assist/WViewController.h>

namespace app_assist {

/**
 * @brief A view shown as a popup, owned by the controller it is attached to.
 *
 * The functions below configure the popup before it is attached, or from within its content
 * function. A popup class may instead override onCreateView() and build the popup itself.
 */
class APP_ASSIST_EXPORT WPopupController : public WViewController {
public:
    /** Makes the content. Given the popup; returns the content, or null for none. */
    using ContentFunction = std::function<Evas_Object*(Evas_Object* parent)>;
    /** A click on a button. The flag starts false: the popup closes. True keeps it open. */
    using ClickFunction = std::function<void(bool* keepOpen)>;
    /** Receives a button that was just made. */
    using ButtonFunction = std::function<void(Evas_Object* button)>;
    /**
     * The back key. The flag starts true: the framework destroys the popup after the function.
     * False: the function closes the popup itself, or keeps it open.
     */
    using BackFunction = std::function<void(bool* destroyPopup)>;
    /** Receives the popup that was just made, before its content. */
    using PropertiesFunction = std::function<void(Evas_Object* popup)>;

    WPopupController();
    ~WPopupController() override;

    void setContent(const ContentFunction& content);

    /**
     * @brief Adds a button; at most three.
     * @param text Label, already translated.
     * @param clicked May be empty: the button just closes the popup.
     * @param created May be empty.
     */
    void addButton(const std::string& text, const ClickFunction& clicked,
                   const ButtonFunction& created = {});

    /** @brief Sets what the back key does; without it the popup is destroyed. */
    void setOnBack(const BackFunction& back);

    void setOnAddProperties(const PropertiesFunction& properties);

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;
    void onDestroy() override;

private:
    struct Button {
        std::string text;
        ClickFunction clicked;
        ButtonFunction created;
        Evas_Object* object = nullptr;
    };
    static void _buttonClickedCb(void* data, Evas_Object* button, void* info);
    static void _backKeyCb(void* data, Evas_Object* popup, void* info);
    void createButtons(Evas_Object* popup);
    /** Runs a click function and closes the popup unless it says otherwise. */
    void onButtonClicked(const ClickFunction& clicked);

    ContentFunction _content;
    std::vector<Button> _buttons;
    BackFunction _back;
    PropertiesFunction _properties;
};

} // namespace app_assist
