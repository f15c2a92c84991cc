#pragma once

#include "tools/check/lists.h"
#include "tools/check/medium_files.h"
#include "tools/check/report.h"

namespace onramp::check {

// Each function checks one subject. It adds its findings to the report, which is files.report()
// unless there is a parameter for it. A function that "reports" something also fills the report's
// members that describe what users will see.

/// Checks the models' names in the medium description, and compares them with the names in the
/// model information.
void checkModelNames(const Lists& lists, Report& report);

/// Reports the connections that each model offers, and the page that the wizard begins with.
void describeModels(const Lists& lists, Report& report);

/// Checks and reports the range of systems that the medium supports, and the package that opens on
/// each of them.
void checkPackages(const MediumFiles& files, const Lists& lists);

/// Checks that the wireless set-up tool exists and has a program and a name. If the name contains
/// the maker's name, checks that every translation does, too.
void checkTool(const MediumFiles& files, const Lists& lists);

/// Checks the application's program file. If the medium offers the online service, also checks the
/// application's list of the countries that have the service.
void checkApplication(const MediumFiles& files, const Lists& lists);

/// Checks the values that the wizard passes to the network and to other programs: the service type,
/// the vendor's name and the series code. Checks that the application declares the service type,
/// unless the type itself is wrong.
void checkIdentity(const Lists& lists, Report& report);

/// Checks the texts of every language, and reports how many texts each language has.
void checkTexts(const MediumFiles& files, const Lists& lists);

/// Checks the pictures of the connections and the application's background picture.
void checkPictures(const MediumFiles& files);

}  // namespace onramp::check
