#pragma once

#include <string>
#include <vector>

#include "app/search_wait.h"

namespace onramp::devices {

/// The exit status when the command line is wrong, the medium lacks what a search needs, `ask` gets
/// no usable answer, or the output cannot be written.
inline constexpr int kTrouble = 2;

/// The exit status of `browse` when it finds no device.
inline constexpr int kNothingFound = 1;

struct BrowseOptions {
  std::string medium;
  std::vector<std::string> models;
  double seconds = std::chrono::duration<double>(kMostPauses * kFirstSearchPause).count();
  bool allTypes = false;
  bool json = false;
  bool verbose = false;
};

struct AskOptions {
  std::string address;
  bool json = false;
  bool verbose = false;
};

struct URIOptions {
  std::string uri;
  double seconds = 5;
};

struct HostsOptions {
  bool search = true;
  bool json = false;
};

// The commands. Each prints its result on standard output, or a message on standard error, and
// returns the program's exit status.

int browse(const BrowseOptions& options);
int ask(const AskOptions& options);
int showURI(const URIOptions& options);
int showHosts(const HostsOptions& options);

}  // namespace onramp::devices
