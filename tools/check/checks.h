#pragma once

#include "tools/check/lists.h"
#include "tools/check/medium_files.h"
#include "tools/check/report.h"

namespace onramp::check {

// Each checks one subject and adds to the report what is wrong, or what users will see.

/// The names of the models, in and between the two lists.
void checkModelNames(const Lists& lists, Report& report);

/// The models' connections and the page that the wizard begins with.
void describeModels(const Lists& lists, Report& report);

/// The supported range of systems and the package that each of them gets.
void checkPackages(const MediumFiles& files, const Lists& lists);

/// The wireless set-up tool.
void checkTool(const MediumFiles& files, const Lists& lists);

/// The application beside the lists: its program, its resources.
void checkApplication(const MediumFiles& files, const Lists& lists);

/// What goes out into the network and to other programs: the service type, the vendor name, the
/// series code.
void checkIdentity(const Lists& lists, Report& report);

/// The texts of every language.
void checkTexts(const MediumFiles& files, const Lists& lists);

/// The pictures of the connections, and the application's background.
void checkPictures(const MediumFiles& files);

}  // namespace onramp::check
