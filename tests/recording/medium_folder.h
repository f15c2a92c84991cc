#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "platform/property_list.h"
#include "tests/recording/temporary_folder.h"

namespace onramp::recording {

/// A temporary folder that holds a medium and the application-support folders. The medium holds the
/// running application's bundle. The destructor removes the folder and restores the environment
/// variables that this object has changed.
class MediumFolder {
 public:
  /// Makes a medium that holds only an application bundle. Sets environment variables that put the
  /// application-support folders here, choose English and simulate macOS 10.9.5.
  MediumFolder();
  MediumFolder(const MediumFolder&) = delete;
  MediumFolder& operator=(const MediumFolder&) = delete;
  ~MediumFolder();

  /// Returns the full path of a file on the medium.
  [[nodiscard]] std::string path(const std::string& relative) const {
    return root_ / "medium/" + relative;
  }

  /// Writes a file to the medium, creating its folder if needed.
  void write(const std::string& relative, const std::string& bytes) const;
  void write(const std::string& relative, const Dictionary& dictionary) const;
  /// Makes a file on the medium executable by its owner.
  void makeExecutable(const std::string& relative) const;

  /// Writes the medium's three property lists. Adds the entries "CDInfo", "ModelInfo" and
  /// "VenderName" ("Kestrel Imaging") to `resources`. `modelInfo` maps models' names to their
  /// entries.
  void describe(const Dictionary& resources, const Dictionary& cdInfo,
                const Dictionary& modelInfo) const;

  /// Adds a set-up tool to the medium. The tool records its arguments and exits with `status`.
  void addSetUpTool(int status) const;

  /// Returns the arguments of the tool's last run, or an empty string when the tool has not run.
  [[nodiscard]] std::string setUpToolArguments() const;

  /// The two files that the wizard writes for the package. optionsFile() and modelFile() return the
  /// files' contents, or nothing for a file that cannot be read. The other two functions return the
  /// files' paths.
  [[nodiscard]] auto optionsFile() const { return loadDictionary(optionsFilePath()); }
  [[nodiscard]] auto modelFile() const { return loadDictionary(modelFilePath()); }
  [[nodiscard]] std::string optionsFilePath() const {
    return root_ / "local/KestrelImaging/com.kestrelimaging.installpkginfo.plist";
  }
  [[nodiscard]] std::string modelFilePath() const {
    return root_ / "user/KestrelImaging/com.kestrelimaging.instmodel.plist";
  }

  /// Sets an environment variable, or unsets it if `value` is nothing. The destructor restores it.
  void setEnvironment(const std::string& name, const std::optional<std::string>& value);

 private:
  TemporaryFolder root_;
  std::map<std::string, std::optional<std::string>> before_;
};

/// Returns a model-information entry for a model whose identifier is "k1".
[[nodiscard]] Dictionary model(bool usb, bool wired, bool wireless);

/// Returns the contents of a CDInfo.plist that lists the models with these names.
[[nodiscard]] Dictionary containing(const std::vector<std::string>& models);

}  // namespace onramp::recording
