// The hand-off as the netlister sees it: the built program started with a configuration file in
// its own process, driven by real X input, judged by its exit status and the file alone.
#include "config/ini_file.h"
#include "resources/image_data.h"
#include "tests/test_guards.h"

#include <gtest/gtest.h>

#include <wx/fileconf.h>
#include <wx/init.h>

#include <X11/Xatom.h>
#include <X11/Xlib.h>
#include <X11/Xutil.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <optional>
#include <spawn.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>
#include <vector>

extern char** environ;

namespace
{

namespace fs = std::filesystem;
using Clock = std::chrono::steady_clock;

// Generous: a loaded machine starts GTK slowly, and every wait ends as soon as it can.
constexpr auto PATIENCE = std::chrono::seconds(30);
constexpr auto STEP = std::chrono::milliseconds(50);

std::string Slurp(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

std::string InDefaults(const fs::path& path, const char* key)
{
    return ParseIni(Slurp(path))->Read(wxString("/Defaults/") + key, "-").ToStdString();
}

// A window that vanished while we looked at it is no reason to end the test run.
int IgnoreXErrors(Display*, XErrorEvent*) { return 0; }

pid_t Spawn(std::vector<std::string> args)
{
    std::vector<char*> argv;
    for (std::string& arg : args)
        argv.push_back(arg.data());
    argv.push_back(nullptr);
    pid_t pid = -1;
    return posix_spawnp(&pid, argv[0], nullptr, nullptr, argv.data(), environ) == 0 ? pid : -1;
}

// The program as the netlister starts it: one argument, the configuration file.
class Program
{
  public:
    explicit Program(const fs::path& config) : m_pid(Spawn({PROGRAM, config.string()})) {}
    ~Program()
    {
        if (m_pid > 0 && !m_status)
        {
            kill(m_pid, SIGKILL);
            waitpid(m_pid, nullptr, 0);
        }
    }
    pid_t Pid() const { return m_pid; }

    // The raw wait status once the program has ended by itself, nothing if it goes on.
    std::optional<int> Ended()
    {
        for (const auto end = Clock::now() + PATIENCE; !m_status && Clock::now() < end;)
        {
            int status = 0;
            if (waitpid(m_pid, &status, WNOHANG) == m_pid)
                m_status = status;
            else
                std::this_thread::sleep_for(STEP);
        }
        return m_status;
    }

  private:
    pid_t m_pid;
    std::optional<int> m_status;
};

class HandOff : public testing::Test
{
  protected:
    void SetUp() override
    {
        m_display = XOpenDisplay(nullptr);
        ASSERT_NE(m_display, nullptr) << "no X display: run under xvfb-run";
        XSetErrorHandler(IgnoreXErrors);
        // Parked in a corner: the pointer of an earlier test must not rest where the new window
        // opens.
        const Window root = DefaultRootWindow(m_display);
        XWarpPointer(m_display, None, root, 0, 0, 0, 0, DisplayWidth(m_display, 0) - 1,
                     DisplayHeight(m_display, 0) - 1);
        XFlush(m_display);
        char pattern[] = "/tmp/zidovade_process.XXXXXX";
        ASSERT_NE(mkdtemp(pattern), nullptr);
        m_file = fs::path(pattern) / "netlist.ini";
        std::ofstream(m_file, std::ios::binary) << CONFIG;
    }
    void TearDown() override
    {
        if (m_display)
            XCloseDisplay(m_display);
        std::error_code ignored;
        fs::remove_all(m_file.parent_path(), ignored);
    }

    // The program's main window, once it is on screen.
    Window WindowOf(pid_t pid)
    {
        const Atom pidAtom = XInternAtom(m_display, "_NET_WM_PID", False);
        for (const auto end = Clock::now() + PATIENCE; Clock::now() < end;
             std::this_thread::sleep_for(STEP))
        {
            Window root = 0, parent = 0, *children = nullptr;
            unsigned count = 0;
            if (!XQueryTree(m_display, DefaultRootWindow(m_display), &root, &parent, &children,
                            &count))
                continue;
            Window found = 0;
            for (unsigned i = 0; i < count && !found; ++i)
            {
                Atom type = 0;
                int format = 0;
                unsigned long items = 0, left = 0;
                unsigned char* data = nullptr;
                XWindowAttributes attributes;
                if (XGetWindowProperty(m_display, children[i], pidAtom, 0, 1, False, XA_CARDINAL,
                                       &type, &format, &items, &left, &data) == Success &&
                    data && items == 1 &&
                    *reinterpret_cast<unsigned long*>(data) == static_cast<unsigned long>(pid) &&
                    XGetWindowAttributes(m_display, children[i], &attributes) &&
                    attributes.map_state == IsViewable)
                    found = children[i];
                if (data)
                    XFree(data);
            }
            if (children)
                XFree(children);
            if (found)
                return found;
        }
        return 0;
    }

    // Where the Generate tool shows its picture unchanged, that is enabled (the toolkit greys a
    // disabled one): the centre of the picture in window coordinates.
    std::optional<std::pair<int, int>> EnabledGenerateTool(Window window)
    {
        for (const auto end = Clock::now() + PATIENCE; Clock::now() < end;
             std::this_thread::sleep_for(STEP))
            if (auto found = FindPicture(window, COMMAND_BAR_PIXELS[6]))
                return found;
        return std::nullopt;
    }

    std::optional<std::pair<int, int>> FindPicture(Window window, const unsigned char* picture)
    {
        XWindowAttributes attributes;
        if (!XGetWindowAttributes(m_display, window, &attributes))
            return std::nullopt;
        const int width = attributes.width, height = std::min(attributes.height, 120);
        XImage* shot = XGetImage(m_display, window, 0, 0, width, height, AllPlanes, ZPixmap);
        if (!shot)
            return std::nullopt;
        const auto rgb = [shot](int x, int y)
        {
            const unsigned long p = XGetPixel(shot, x, y);
            return std::array<unsigned, 3>{unsigned((p & shot->red_mask) >> 16),
                                           unsigned((p & shot->green_mask) >> 8),
                                           unsigned(p & shot->blue_mask)};
        };
        std::optional<std::pair<int, int>> found;
        for (int top = 0; top + 24 <= height && !found; ++top)
            for (int left = 0; left + 24 <= width && !found; ++left)
            {
                bool same = true;
                for (int i = 0; i < 24 * 24 && same; ++i)
                {
                    const unsigned char* p = picture + 3 * i;
                    if (p[0] == 236 && p[1] == 233 && p[2] == 216)
                        continue; // transparent
                    same = rgb(left + i % 24, top + i / 24) ==
                           std::array<unsigned, 3>{p[0], p[1], p[2]};
                }
                if (same)
                    found = std::make_pair(left + 12, top + 12);
            }
        XDestroyImage(shot);
        return found;
    }

    // What a window manager sends when the user closes the window.
    void SendDeleteWindow(Window window)
    {
        XEvent event{};
        event.xclient.type = ClientMessage;
        event.xclient.window = window;
        event.xclient.message_type = XInternAtom(m_display, "WM_PROTOCOLS", False);
        event.xclient.format = 32;
        event.xclient.data.l[0] = long(XInternAtom(m_display, "WM_DELETE_WINDOW", False));
        event.xclient.data.l[1] = CurrentTime;
        XSendEvent(m_display, window, False, NoEventMask, &event);
        XFlush(m_display);
    }

    static void ExpectExitZero(std::optional<int> status)
    {
        ASSERT_TRUE(status.has_value()) << "the program did not end";
        ASSERT_TRUE(WIFEXITED(*status)) << "ended by signal " << WTERMSIG(*status);
        EXPECT_EQ(WEXITSTATUS(*status), 0);
    }

    static constexpr const char* CONFIG = "; the netlister's configuration\n"
                                          "[Defaults]\nspice=yes\nflat_busses=yes\ngenerate=no\n"
                                          "[Verilog]\ncase=L\n";

    Display* m_display = nullptr;
    fs::path m_file;
};

TEST_F(HandOff, GenerateToolWritesYesAndEndsWithStatusZero)
{
    Program program(m_file);
    ASSERT_GT(program.Pid(), 0);
    const Window window = WindowOf(program.Pid());
    ASSERT_NE(window, 0u) << "no window";
    const auto tool = EnabledGenerateTool(window);
    ASSERT_TRUE(tool) << "no enabled Generate tool on screen";

    // A real pointer: it enters the tool, rests, and clicks.
    const pid_t xdotool = Spawn({"xdotool", "mousemove", "--window", std::to_string(window),
                                 std::to_string(tool->first), std::to_string(tool->second), "sleep",
                                 "0.3", "click", "1"});
    ASSERT_GT(xdotool, 0) << "xdotool missing";
    int clickStatus = 0;
    waitpid(xdotool, &clickStatus, 0);
    ASSERT_EQ(clickStatus, 0);

    ExpectExitZero(program.Ended());
    EXPECT_EQ(InDefaults(m_file, "generate"), "yes");
    EXPECT_EQ(InDefaults(m_file, "flat_busses"), "yes");
}

TEST_F(HandOff, ClosedByTheWindowManagerLeavesTheFileAsItWas)
{
    Program program(m_file);
    ASSERT_GT(program.Pid(), 0);
    const Window window = WindowOf(program.Pid());
    ASSERT_NE(window, 0u) << "no window";
    ASSERT_TRUE(EnabledGenerateTool(window)) << "start-up did not finish"; // the file is loaded
    SendDeleteWindow(window);
    ExpectExitZero(program.Ended());
    EXPECT_EQ(Slurp(m_file), CONFIG);
}

TEST_F(HandOff, MissingFileIsNeverCreated)
{
    const fs::path missing = m_file.parent_path() / "missing.ini";
    Program program(missing);
    ASSERT_GT(program.Pid(), 0);
    const Window window = WindowOf(program.Pid());
    ASSERT_NE(window, 0u) << "no window";
    ASSERT_TRUE(EnabledGenerateTool(window));
    SendDeleteWindow(window);
    ExpectExitZero(program.Ended());
    EXPECT_FALSE(fs::exists(missing));
}

} // namespace

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    wxInitializer wx(argc, argv);
    if (!wx.IsOk())
        return 1;
    InstallTestGuards();
    return RUN_ALL_TESTS();
}
