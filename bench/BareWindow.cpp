// The yardstick of the widget's start-up and memory: a bare Elementary
// window of a 4x2 widget's size, on the buffer engine or, with a display,
// as an X11 window titled "bare-window". Prints "drawn" after its first
// frame, then, with --stay, waits for stdin to close (or SIGTERM) so that
// its memory can be read. With --text it also shows one line of text: the
// cost of the font machinery every widget with words pays and a bare window
// does not.
#include <Elementary.h>

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace
{
bool gStay = false;

void RenderPostCb(void*, Evas* evas, void*)
{
    evas_event_callback_del(evas, EVAS_CALLBACK_RENDER_POST, RenderPostCb);
    printf("drawn\n");
    fflush(stdout);
    if (!gStay)
        elm_exit();
}

Eina_Bool StdinCb(void*, Ecore_Fd_Handler*)
{
    char buffer[64];
    if (read(0, buffer, sizeof(buffer)) <= 0)
        elm_exit();
    return ECORE_CALLBACK_RENEW;
}
}  // namespace

int main(int argc, char** argv)
{
    bool withText = false;
    for (int i = 1; i < argc; ++i)
    {
        gStay = gStay || strcmp(argv[i], "--stay") == 0;
        withText = withText || strcmp(argv[i], "--text") == 0;
    }
    // The same engine the host gives a widget without a display.
    if (!getenv("DISPLAY") && !getenv("WAYLAND_DISPLAY"))
        setenv("ELM_ENGINE", "buffer", 1);
    elm_init(argc, argv);
    elm_app_base_scale_set(2.6);
    Evas_Object* win = elm_win_add(nullptr, "bare-window", ELM_WIN_BASIC);
    elm_win_title_set(win, "bare-window");
    Evas_Object* background = elm_bg_add(win);
    elm_win_resize_object_add(win, background);
    evas_object_show(background);
    if (withText)
    {
        Evas_Object* label = elm_label_add(win);
        elm_object_text_set(label, "Seoul 13°");
        evas_object_move(label, 40, 40);
        evas_object_resize(label, 400, 80);
        evas_object_show(label);
    }
    evas_object_resize(win, 712, 354);
    evas_event_callback_add(evas_object_evas_get(win), EVAS_CALLBACK_RENDER_POST, RenderPostCb, nullptr);
    evas_object_show(win);
    Ecore_Fd_Handler* handler =
        gStay ? ecore_main_fd_handler_add(0, ECORE_FD_READ, StdinCb, nullptr, nullptr, nullptr) : nullptr;
    elm_run();
    if (handler)
        ecore_main_fd_handler_del(handler);
    evas_object_del(win);
    elm_shutdown();
    return 0;
}
