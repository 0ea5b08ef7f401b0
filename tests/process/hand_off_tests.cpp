// The hand-off as the netlister sees it: the built program started with a configuration file in
// its own process, driven by real X input, judged by its exit status and the file alone.
#include "config/ini_file.h"
#include "resources/image_data.h"

#include <gtest/gtest.h>

#include <wx/fileconf.h>

#include <X11/Xatom.h>
#include <X11/Xlib.h>
#include <X11/Xutil.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <memory>
#include <optional>
#include <spawn.h>
#include <string>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

extern char** environ;

namespace
{

namespace fs = std::filesystem;

// Asks again until the answer comes; generous, as a loaded machine starts GTK slowly.
template <class Ask> auto Poll(Ask ask)
{
    const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(30);
    auto answer = ask();
    for (; !answer && std::chrono::steady_clock::now() < end; answer = ask())
        std::this_thread::sleep_for(std::chrono::milliseconds(50));
    return answer;
}

std::string Slurp(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

// The program started as the netlister starts it, with one argument, the configuration file, and
// its main window once start-up has loaded that file.
class HandOff : public testing::Test
{
  protected:
    void SetUp() override
    {
        ASSERT_NE(m_display, nullptr) << "no X display: run under xvfb-run";
        // A window that vanished while we looked at it is no reason to end the test run.
        XSetErrorHandler([](Display*, XErrorEvent*) { return 0; });
        // Parked in a corner: the pointer of an earlier test must not rest where the new window
        // opens.
        XWarpPointer(m_display, None, DefaultRootWindow(m_display), 0, 0, 0, 0,
                     DisplayWidth(m_display, 0) - 1, DisplayHeight(m_display, 0) - 1);
        XFlush(m_display);
        char pattern[] = "/tmp/zidovade_process.XXXXXX";
        ASSERT_NE(mkdtemp(pattern), nullptr);
        m_file = fs::path(pattern) / "netlist.ini";
        std::ofstream(m_file, std::ios::binary) << CONFIG;

        char* argv[] = {const_cast<char*>(PROGRAM), const_cast<char*>(m_file.c_str()), nullptr};
        ASSERT_EQ(posix_spawn(&m_pid, PROGRAM, nullptr, nullptr, argv, environ), 0);
        m_window = StartedWindow();
        ASSERT_NE(m_window, 0u) << "no window with an enabled Generate tool";
    }
    void TearDown() override
    {
        if (m_pid > 0 && !m_status && kill(m_pid, SIGKILL) == 0)
            waitpid(m_pid, nullptr, 0);
        if (m_display)
            XCloseDisplay(m_display);
        fs::remove_all(m_file.parent_path());
    }

    // The raw wait status once the program has ended by itself (0: exit status 0), or nothing.
    std::optional<int> Ended()
    {
        int raw = 0;
        if (Poll([&] { return waitpid(m_pid, &raw, WNOHANG) == m_pid; }))
            m_status = raw;
        return m_status;
    }

    // Only once start-up has loaded the file is the Generate tool enabled, and the toolkit greys
    // a disabled one. Notes where the tool shows.
    Window StartedWindow()
    {
        const Atom pidAtom = XInternAtom(m_display, "_NET_WM_PID", False);
        return Poll(
            [&]
            {
                Window root = 0, parent = 0, *children = nullptr, found = 0;
                unsigned count = 0;
                XQueryTree(m_display, DefaultRootWindow(m_display), &root, &parent, &children,
                           &count);
                for (unsigned i = 0; i < count && !found; ++i)
                {
                    Atom type = 0;
                    int format = 0;
                    unsigned long items = 0, left = 0;
                    unsigned char* data = nullptr;
                    XGetWindowProperty(m_display, children[i], pidAtom, 0, 1, False, XA_CARDINAL,
                                       &type, &format, &items, &left, &data);
                    if (items == 1 && *reinterpret_cast<unsigned long*>(data) == unsigned(m_pid) &&
                        (m_generateTool = FindPicture(children[i], COMMAND_BAR_PIXELS[6])))
                        found = children[i];
                    XFree(data);
                }
                XFree(children);
                return found;
            });
    }

    // The centre of where the window shows the picture unchanged, in window coordinates. The
    // command bar lies within the top left of the window, which is 520 wide at least; a window
    // not yet on screen gives no image.
    std::optional<std::pair<int, int>> FindPicture(Window window, const unsigned char* picture)
    {
        const int width = 480, height = 100;
        const std::unique_ptr<XImage, int (*)(XImage*)> shot(
            XGetImage(m_display, window, 0, 0, width, height, AllPlanes, ZPixmap),
            [](XImage* image) { return XDestroyImage(image); });
        if (!shot)
            return std::nullopt;
        for (int top = 0; top + 24 <= height; ++top)
            for (int left = 0; left + 24 <= width; ++left)
            {
                bool same = true;
                for (int i = 0; i < 24 * 24 && same; ++i)
                {
                    const unsigned char* p = picture + 3 * i;
                    const bool transparent = p[0] == 236 && p[1] == 233 && p[2] == 216;
                    // The display is 24 bits deep: a pixel is 0xRRGGBB.
                    same = transparent || XGetPixel(shot.get(), left + i % 24, top + i / 24) ==
                                              unsigned(p[0] << 16 | p[1] << 8 | p[2]);
                }
                if (same)
                    return std::make_pair(left + 12, top + 12);
            }
        return std::nullopt;
    }

    static constexpr const char* CONFIG = "; the netlister's configuration\n"
                                          "[Defaults]\nspice=yes\nflat_busses=yes\ngenerate=no\n"
                                          "[Verilog]\ncase=L\n";

    Display* m_display = XOpenDisplay(nullptr);
    fs::path m_file;
    pid_t m_pid = -1;
    std::optional<int> m_status;
    Window m_window = 0;
    std::optional<std::pair<int, int>> m_generateTool;
};

TEST_F(HandOff, GenerateToolWritesYesAndEndsWithStatusZero)
{
    // A real pointer: it enters the tool, rests, and clicks.
    const auto [x, y] = *m_generateTool;
    const std::string click = "xdotool mousemove --window " + std::to_string(m_window) + " " +
                              std::to_string(x) + " " + std::to_string(y) + " sleep 0.3 click 1";
    ASSERT_EQ(std::system(click.c_str()), 0) << "xdotool missing or failed";
    EXPECT_EQ(Ended(), 0) << "raw wait status; none: it did not end";
    EXPECT_EQ(ParseIni(Slurp(m_file))->Read("/Defaults/generate", "-"), "yes");
}

TEST_F(HandOff, ClosedByTheWindowManagerLeavesTheFileAsItWas)
{
    // What a window manager sends when the user closes the window.
    XEvent event{};
    event.xclient.type = ClientMessage;
    event.xclient.window = m_window;
    event.xclient.message_type = XInternAtom(m_display, "WM_PROTOCOLS", False);
    event.xclient.format = 32;
    event.xclient.data.l[0] = long(XInternAtom(m_display, "WM_DELETE_WINDOW", False));
    XSendEvent(m_display, m_window, False, NoEventMask, &event);
    XFlush(m_display);
    EXPECT_EQ(Ended(), 0) << "raw wait status; none: it did not end";
    EXPECT_EQ(Slurp(m_file), CONFIG);
}

} // namespace
