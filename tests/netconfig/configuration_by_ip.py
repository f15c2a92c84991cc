"""What iproute2 says of this computer's IPv4 configuration: a line with the name of the primary
interface, and one for every usable interface with its name, its first address, and its addresses,
masks and broadcast addresses."""

import ipaddress
import json
import subprocess


def ip(*arguments):
    return json.loads(subprocess.check_output(("ip", "-j") + arguments) or "[]")


def mask(prefix):
    return str(ipaddress.ip_network(f"0.0.0.0/{prefix}").netmask)


defaults = [r for r in ip("route", "show", "default") if r.get("type", "unicast") == "unicast"]
best = min(defaults, key=lambda r: r.get("metric", 0), default={})
print(best["dev"] if "dev" in best else best.get("nexthops", [{"dev": ""}])[0]["dev"])

for link in ip("addr"):
    addresses = [a for a in link["addr_info"] if a["family"] == "inet"]
    if addresses and "UP" in link["flags"] and "NO-CARRIER" not in link["flags"]:
        lists = ([a["local"] for a in addresses], [mask(a["prefixlen"]) for a in addresses],
                 [a["broadcast"] for a in addresses if "broadcast" in a])
        print(link["ifname"], lists[0][0],
              "".join("".join(one + "," for one in texts) + "|" for texts in lists))
