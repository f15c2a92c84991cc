#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tests/recording/temporary_folder.h"

namespace onramp::recording {

/// A medium in a temporary folder, with the application's bundle on it as the main bundle, private
/// application-support folders, and an xdg-open that only writes down what it is to open. Removed
/// at destruction, and so are the environment variables that it set.
class MediumFolder {
 public:
  /// An application bundle and nothing else.
  MediumFolder();
  MediumFolder(const MediumFolder&) = delete;
  MediumFolder& operator=(const MediumFolder&) = delete;
  ~MediumFolder();

  [[nodiscard]] std::string path(const std::string& relative) const;

  void write(const std::string& relative, const std::string& bytes) const;
  void write(const std::string& relative, const Dictionary& dictionary) const;
  void makeExecutable(const std::string& relative) const;

  /// Writes the three property lists, with entries for "CDInfo" and "ModelInfo" added to
  /// `resources`.
  void describe(const Dictionary& resources, const Dictionary& cdInfo,
                const Dictionary& modelInfo) const;

  /// A set-up tool on the medium that writes down its argument and exits with `status`.
  void addSetUpTool(int status) const;
  [[nodiscard]] std::string setUpToolArguments() const;

  /// Everything that was opened so far, one a line; waits a while for the `count`th to arrive.
  [[nodiscard]] std::vector<std::string> opened(std::size_t count) const;

  /// The hand-off files with the vendor name "Kestrel Imaging"; nothing when absent.
  [[nodiscard]] std::optional<Dictionary> optionsFile() const;
  [[nodiscard]] std::optional<Dictionary> modelFile() const;
  [[nodiscard]] std::string optionsFilePath() const;
  [[nodiscard]] std::string modelFilePath() const;

  void setEnvironment(const std::string& name, const std::optional<std::string>& value);

 private:
  TemporaryFolder root_;
  std::map<std::string, std::optional<std::string>> before_;
};

/// A model's entry in the model information.
[[nodiscard]] Dictionary model(bool usb, bool wired, bool wireless);

/// A medium description whose "ContainedModel" has these names.
[[nodiscard]] Dictionary containing(const std::vector<std::string>& models);

}  // namespace onramp::recording
