"""What iproute2 says of this computer's IPv4 configuration: a line for every usable interface with
its name, addresses, masks and broadcast addresses, and a last line that names the primary one."""

import ipaddress
import json
import subprocess


def ip(*arguments):
    return json.loads(subprocess.check_output(("ip", "-j") + arguments) or "[]")


def mask(prefix):
    return str(ipaddress.ip_network(f"0.0.0.0/{prefix}").netmask)


for link in ip("addr"):
    addresses = [a for a in link["addr_info"] if a["family"] == "inet"]
    if addresses and "UP" in link["flags"] and "NO-CARRIER" not in link["flags"]:
        print(link["ifname"],
              ",".join(a["local"] for a in addresses),
              ",".join(mask(a["prefixlen"]) for a in addresses),
              ",".join(a["broadcast"] for a in addresses if "broadcast" in a), sep="|")

defaults = [r for r in ip("route", "show", "default") if r.get("type", "unicast") == "unicast"]
best = min(defaults, key=lambda r: r.get("metric", 0), default={})
print("primary", best["dev"] if "dev" in best else best.get("nexthops", [{"dev": ""}])[0]["dev"],
      sep="|")
