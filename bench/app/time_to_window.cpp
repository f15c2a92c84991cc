// Starts a program on an empty display. Prints the milliseconds until the middle of the screen
// changes, and the program's peak resident memory 0.3 seconds later, in KiB. Then kills the
// program. Fails if the program exits first, or if it draws nothing within 30 seconds.

#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <cstdio>
#include <fstream>
#include <memory>
#include <string>
#include <thread>

namespace {

using Clock = std::chrono::steady_clock;
using DisplayHandle = std::unique_ptr<Display, int (*)(Display*)>;

constexpr std::chrono::seconds kLongest{30};
constexpr std::chrono::milliseconds kSettle{300};

unsigned long middlePixel(Display* display) {
  const int screen = DefaultScreen(display);
  XImage* const image =
      XGetImage(display, RootWindow(display, screen), DisplayWidth(display, screen) / 2,
                DisplayHeight(display, screen) / 2, 1, 1, AllPlanes, ZPixmap);
  if (!image) return 0;
  const unsigned long pixel = XGetPixel(image, 0, 0);
  XDestroyImage(image);
  return pixel;
}

long peakMemory(pid_t process) {
  std::ifstream status("/proc/" + std::to_string(process) + "/status");
  for (std::string word; status >> word;) {
    long kibibytes = 0;
    if (word == "VmHWM:" && status >> kibibytes) return kibibytes;
  }
  return 0;
}

void end(pid_t process) {
  kill(process, SIGKILL);
  waitpid(process, nullptr, 0);
}

}  // namespace

int main(int argc, char** argv) {
  if (argc < 2) {
    std::fprintf(stderr, "usage: time_to_window PROGRAM [ARGUMENT…], with DISPLAY set\n");
    return 2;
  }
  const DisplayHandle display(XOpenDisplay(nullptr), XCloseDisplay);
  if (!display) {
    std::fprintf(stderr, "time_to_window: there is no display; set DISPLAY\n");
    return 2;
  }
  const unsigned long before = middlePixel(display.get());
  const Clock::time_point start = Clock::now();
  pid_t process = 0;
  if (posix_spawn(&process, argv[1], nullptr, nullptr, argv + 1, environ) != 0) {
    std::fprintf(stderr, "time_to_window: %s cannot be started\n", argv[1]);
    return 2;
  }
  while (middlePixel(display.get()) == before) {
    if (Clock::now() - start > kLongest || waitpid(process, nullptr, WNOHANG) == process) {
      std::fprintf(stderr, "time_to_window: %s has shown nothing\n", argv[1]);
      end(process);
      return 1;
    }
    std::this_thread::sleep_for(std::chrono::microseconds(200));
  }
  const std::chrono::duration<double, std::milli> taken = Clock::now() - start;
  std::this_thread::sleep_for(kSettle);
  std::printf("%.2f %ld\n", taken.count(), peakMemory(process));
  end(process);
  return 0;
}
