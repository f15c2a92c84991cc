"""Makes media for tests."""

import pathlib
import plistlib
import shutil

RESOURCES = "MacResources/CDCommonInfo.plist"


def write(path, value):
    path.parent.mkdir(parents=True, exist_ok=True)
    path.write_bytes(plistlib.dumps(value))


def model(usb=False, wired=False, wireless=False):
    return {"KSCID": "k", "Interfaces": {"USB": usb, "WiredLAN": wired, "WirelessLAN": wireless}}


def make(folder, built, models, tool_status=0, **resources):
    """Makes a medium in `folder`, with the application, messages and pictures of the medium `built`.

    Adds `resources` to CDCommonInfo.plist, replacing entries with the same keys. The set-up tool
    writes its arguments to the file "tool" in `folder` and exits with `tool_status`. Returns the
    folder's path.
    """
    folder, built = pathlib.Path(folder), pathlib.Path(built)
    shutil.copytree(built / "Onramp OSX.app", folder / "Onramp OSX.app")
    (folder / "MacResources").mkdir()
    for shared in ("CDCommonMessage.bundle", "Images"):
        (folder / "MacResources" / shared).symlink_to(built / "MacResources" / shared)
    write(folder / RESOURCES, {
        "CDInfo": "MacResources/CDInfo.plist",
        "ModelInfo": "MacResources/ModelInfo.plist",
        "BonjourNetwork": "_pdl-datastream._tcp.",
        "VenderName": "Kestrel Imaging",
        "PkgInfo": {"PkgName": "Kestrel.pkg", "PkgLocation": "Packages"},
        "WLANtool": "Setup.app",
    } | resources)
    write(folder / "MacResources/CDInfo.plist", {
        "ContainedModel": {name: {} for name in models},
        "KSCSeriesCode": "KS7",
        "InstallPKG": {"PKG_WebLink": True},
    })
    write(folder / "MacResources/ModelInfo.plist", {"Model": models})
    (folder / "Packages").mkdir()
    (folder / "Packages/Kestrel.pkg").write_text("stand-in")
    write(folder / "Setup.app/Contents/Info.plist",
          {"CFBundleExecutable": "setup", "CFBundleDisplayName": "Wireless Setup"})
    make_tool(folder, tool_status)
    return folder


def make_tool(folder, status):
    """Makes or replaces the set-up tool of the medium in `folder`. The tool exits with `status`."""
    tool = folder / "Setup.app/Contents/Linux/setup"
    tool.parent.mkdir(exist_ok=True)
    tool.write_text(f"#!/bin/sh\nprintf '%s' \"$*\" > '{folder}/tool'\nexit {status}\n")
    tool.chmod(0o755)
