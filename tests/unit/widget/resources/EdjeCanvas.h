#ifndef WEATHER_TESTS_WIDGET_RESOURCES_EDJE_CANVAS_H
#define WEATHER_TESTS_WIDGET_RESOURCES_EDJE_CANVAS_H

#include <Ecore_Evas.h>
#include <Edje.h>

#include <string>
#include <utility>
#include <vector>

namespace WeatherTest
{

// The widget's resource folder in the build tree.
inline std::string WidgetResDir()
{
    return WEATHER_TEST_WIDGET_RES_DIR;
}

inline std::string WidgetLayoutFile(const std::string& name)
{
    return WidgetResDir() + "widget/" + name;
}

// A buffer canvas for loading layout groups and feeding them touches.
class EdjeCanvas
{
public:
    EdjeCanvas(int w, int h)
    {
        ecore_evas_init();
        edje_init();
        // The host runs at the app base scale, where layout pixels are
        // canvas pixels.
        edje_scale_set(2.6);
        mEe = ecore_evas_buffer_new(w, h);
        mEvas = mEe ? ecore_evas_get(mEe) : nullptr;
    }
    ~EdjeCanvas()
    {
        if (mEe)
            ecore_evas_free(mEe);
        edje_scale_set(1.0);
        edje_shutdown();
        ecore_evas_shutdown();
    }
    EdjeCanvas(const EdjeCanvas&) = delete;
    EdjeCanvas& operator=(const EdjeCanvas&) = delete;

    Evas* GetEvas() const { return mEvas; }

    // Loads `group` of `file` at (0, 0, w, h); nullptr if it does not load.
    Evas_Object* Load(const std::string& file, const char* group, int w, int h)
    {
        Evas_Object* obj = edje_object_add(mEvas);
        if (!edje_object_file_set(obj, file.c_str(), group))
        {
            evas_object_del(obj);
            return nullptr;
        }
        evas_object_move(obj, 0, 0);
        evas_object_resize(obj, w, h);
        evas_object_show(obj);
        edje_object_calc_force(obj);
        return obj;
    }

    Evas_Object* Rect()
    {
        Evas_Object* rect = evas_object_rectangle_add(mEvas);
        evas_object_show(rect);
        return rect;
    }

    void Press(int x, int y)
    {
        evas_event_feed_mouse_move(mEvas, x, y, ++mTime, nullptr);
        evas_event_feed_mouse_down(mEvas, 1, EVAS_BUTTON_NONE, ++mTime, nullptr);
    }
    void Release(int x, int y)
    {
        evas_event_feed_mouse_move(mEvas, x, y, ++mTime, nullptr);
        evas_event_feed_mouse_up(mEvas, 1, EVAS_BUTTON_NONE, ++mTime, nullptr);
    }
    void Tap(int x, int y)
    {
        Press(x, y);
        Release(x, y);
    }

private:
    Ecore_Evas* mEe = nullptr;
    Evas* mEvas = nullptr;
    unsigned int mTime = 1000;
};

// Records the signals an Edje object emits.
class SignalRecorder
{
public:
    explicit SignalRecorder(Evas_Object* obj) : mObj(obj)
    {
        edje_object_signal_callback_add(mObj, "*", "*", SignalCb, this);
    }
    ~SignalRecorder() { edje_object_signal_callback_del_full(mObj, "*", "*", SignalCb, this); }
    SignalRecorder(const SignalRecorder&) = delete;
    SignalRecorder& operator=(const SignalRecorder&) = delete;

    bool Saw(const std::string& signal, const std::string& source)
    {
        // A program's own emission is queued behind the signal that ran it.
        for (int pass = 0; pass < 3; ++pass) edje_object_message_signal_process(mObj);
        for (const auto& seen : mSeen)
        {
            if (seen.first == signal && seen.second == source)
                return true;
        }
        return false;
    }

private:
    static void SignalCb(void* data, Evas_Object*, const char* emission, const char* source)
    {
        auto* pThis = static_cast<SignalRecorder*>(data);
        if (pThis && emission && source)
            pThis->mSeen.emplace_back(emission, source);
    }

    Evas_Object* mObj;
    std::vector<std::pair<std::string, std::string>> mSeen;
};

// Name of the state a part of `obj` is in, after pending signals ran.
inline std::string PartState(Evas_Object* obj, const char* part)
{
    edje_object_message_signal_process(obj);
    edje_object_calc_force(obj);
    double value = 0.0;
    const char* state = edje_object_part_state_get(obj, part, &value);
    return state ? state : "";
}

inline void Signal(Evas_Object* obj, const char* emission, const char* source)
{
    edje_object_signal_emit(obj, emission, source);
    edje_object_message_signal_process(obj);
    edje_object_calc_force(obj);
}

}  // namespace WeatherTest

#endif
