#pragma once

#include "tools/check/lists.h"
#include "tools/check/medium_files.h"
#include "tools/check/report.h"

namespace onramp::check {

// Each check adds its findings to the report, which is files.report() if the function has no
// parameter for the report. Some functions also set members of the report.

/// Checks the models' names in the medium description, and compares them with the names in the
/// model information.
void checkModelNames(const Lists& lists, Report& report);

/// Sets the members `models` and `start` of the report. Checks nothing.
void describeModels(const Lists& lists, Report& report);

/// Reports models whose connections are all switched off in the model information.
void checkConnections(const Lists& lists, Report& report);

/// Checks the range of systems that the medium supports. Sets the report's member `systems`.
void checkRange(const Lists& lists, Report& report);

/// Checks the packages for the supported systems. Sets the report's member `packages`.
void checkPackages(const MediumFiles& files, const Lists& lists);

/// Checks that the wireless set-up tool exists, has a program and a name, and translates the name
/// in each of its languages. If the tool's name contains the maker's name, checks that every
/// translation does, too.
void checkTool(const MediumFiles& files, const Lists& lists);

/// Sets the members `identifier` and `platforms` of the report. Checks nothing.
void describeApplication(const MediumFiles& files, const Lists& lists);

/// Checks the application's program file. If the medium offers the online service, also checks the
/// application's list of the countries that have the service.
void checkApplication(const MediumFiles& files, const Lists& lists);

/// Checks the values that the wizard passes to the network and to other programs: the service type,
/// the vendor's name and the series code. If the service type is valid, also checks that the
/// application declares it.
void checkIdentity(const Lists& lists, Report& report);

/// Checks the texts in every language. Sets the report's member `languages`.
void checkTexts(const MediumFiles& files, const Lists& lists);

/// Checks the pictures of the connections and the application's background picture.
void checkPictures(const MediumFiles& files);

}  // namespace onramp::check
