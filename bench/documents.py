#!/usr/bin/env python3
"""Makes the messages that are measured: bench/documents.py [FOLDER], by itself build/bench.

Eight messages from 160 bytes to 1 MiB, the same ones every time. Each is a mixture of what an
operator sends: proxies, access points, applications, mail accounts. The larger ones hold every kind
of characteristic, and those named in TABLES refer to texts that occur more than once in a string
table. Beside NAME.push stand NAME.wbxml, its body alone, for programs that know no push header, and
NAME.floor, the heap work that its records need (see floor.py).
"""

import importlib.machinery
import importlib.util
import sys
from pathlib import Path
from xml.dom.minidom import getDOMImplementation

sys.dont_write_bytecode = True
ROOT = Path(__file__).resolve().parent.parent

import floor


def encoder():
    """The encoder of the samples."""
    loader = importlib.machinery.SourceFileLoader("encode_sample", str(ROOT / "tools/encode-sample"))
    module = importlib.util.module_from_spec(importlib.util.spec_from_loader(loader.name, loader))
    loader.exec_module(module)
    return module


# --- What an operator sends, the n-th time ---------------------------------------------------------
#
# (TYPE, parameters, nested characteristics)


def proxy(n):
    ports = [("PORT", [("PORTNBR", "9201"), ("SERVICE", "CO-WSP")], [])]
    physical = [
        ("PHYSICAL-PROXY-ID", f"gate-{n}"),
        ("PXADDR", f"192.0.2.{n % 250}"),
        ("PXADDRTYPE", "IPV4"),
        ("TO-NAPID", f"internet-{n}"),
    ]
    parms = [
        ("PROXY-ID", f"proxy-{n}"),
        ("NAME", "Browsing"),
        ("STARTPAGE", "http://wap.example.com/"),
    ]
    return "PXLOGICAL", parms, [("PXPHYSICAL", physical, ports)]


def guarded_proxy(n):
    kind, parms, nested = proxy(n)
    login = [("PXAUTH-TYPE", "HTTP-BASIC"), ("PXAUTH-ID", f"user{n}"), ("PXAUTH-PW", "open sesame")]
    parms = parms + [("DOMAIN", "example.com"), ("DOMAIN", "example.net"), ("TRUST", "1")]
    return kind, parms, [("PXAUTHINFO", login, [])] + nested


def access_point(n):
    login = [("AUTHTYPE", "PAP"), ("AUTHNAME", "guest"), ("AUTHSECRET", "secret")]
    parms = [
        ("NAPID", f"internet-{n}"),
        ("NAME", "Internet"),
        ("BEARER", "GSM-GPRS"),
        ("NAP-ADDRESS", "web.example.com"),
        ("NAP-ADDRTYPE", "APN"),
    ]
    return "NAPDEF", parms, [("NAPAUTHINFO", login, [])]


def dialled_point(n):
    parms = [
        ("NAPID", f"dial-{n}"),
        ("NAME", f"Dial-up {n}"),
        ("BEARER", "GSM-CSD"),
        ("INTERNET", None),
        ("NAP-ADDRESS", f"+4930123{n:04}"),
        ("NAP-ADDRTYPE", "E164"),
        ("CALLTYPE", "ANALOG-MODEM"),
        ("LINKSPEED", "28800"),
        ("LINGER", "300"),
        ("DNS-ADDR", "192.0.2.53"),
        ("DNS-ADDR", "198.51.100.53"),
    ]
    valid = [("COUNTRY", "262"), ("NETWORK", "01"), ("VALIDUNTIL", "2030-12-31T00:00:00Z")]
    return "NAPDEF", parms, [("VALIDITY", valid, [])]


def browser(n):
    page = [("URI", f"http://wap.example.com/{n}"), ("NAME", "Portal"), ("STARTPAGE", None)]
    parms = [("APPID", "w2"), ("NAME", "Browser"), ("TO-PROXY", f"proxy-{n}")]
    return "APPLICATION", parms, [("RESOURCE", page, [])]


def messaging(n):
    parms = [
        ("APPID", "w4"),
        ("NAME", "MMS"),
        ("TO-PROXY", f"proxy-{n}"),
        ("ADDR", "http://mms.example.com/"),
    ]
    return "APPLICATION", parms, []


def mail(n):
    login = [
        ("AAUTHTYPE", "HTTP,BASIC"),
        ("AAUTHNAME", f"user{n}@example.com"),
        ("AAUTHSECRET", f"pass phrase {n}"),
    ]
    server = [("ADDR", "imap.example.com"), ("ADDRTYPE", "ALPHA")]
    port = [("PORTNBR", "143"), ("SERVICE", "IMAP4")]
    parms = [
        ("APPID", "143"),
        ("PROVIDER-ID", "example.com"),
        ("NAME", "Mail"),
        ("TO-NAPID", f"internet-{n}"),
    ]
    return "APPLICATION", parms, [("APPADDR", server, [("PORT", port, [])]), ("APPAUTH", login, [])]


def bootstrap(n):
    parms = [
        ("NAME", f"Example Mobile {n}"),
        ("NETWORK", "01"),
        ("NETWORK", "02"),
        ("COUNTRY", "262"),
        ("PROXY-ID", f"proxy-{n}"),
        ("PROVURL", "http://provisioning.example.com/"),
        ("CONTEXT-ALLOW", "0"),
    ]
    return "BOOTSTRAP", parms, []


def client(n):
    return "CLIENTIDENTITY", [("CLIENT-ID", f"client-{n}")], []


def access(n):
    parms = [
        ("RULE", f"rule {n}"),
        ("APPID", "w2"),
        ("APPID", "w4"),
        ("PORTNBR", "80"),
        ("DOMAIN", "example.com"),
        ("TO-NAPID", f"internet-{n}"),
        ("TO-PROXY", f"proxy-{n}"),
    ]
    return "ACCESS", parms, []


def vendor(n):
    return "VENDORCONFIG", [("NAME", "example.com"), ("HomeScreen", f"night {n}")], []


def wifi(n):
    parms = [("NETSSID", f"Hotspot {n}"), ("SECMODE", "WPA2"), ("EAPTYPE", "SIM"), ("PRIORITY", "1")]
    return "WI-FI", parms, []


def calls_over_wifi(n):
    return "Vodafone VoWiFi", [("ePDG FQDN", f"epdg{n}.example.com")], []


def voice(n):
    parms = [
        ("APPID", "ap2004"),
        ("NAME", "Video calls"),
        ("XCAP_AUID_DCS", f"dcs-{n}"),
        ("FROM", f"sip:user{n}@example.com"),
    ]
    roaming = [("SYNC-ALLOWED", "1"), ("SYNC-DEFAULT", "0")]
    return "APPLICATION", parms, [("ROAMING", roaming, [])]


TYPICAL = (proxy, access_point, access_point, browser, mail)
# What fills the larger messages. The last six come once in each round.
ROUND = (
    (proxy, access_point, browser, mail, guarded_proxy, dialled_point, messaging, access_point) * 3
    + (bootstrap, access, vendor, wifi, calls_over_wifi, voice)
)

# Name, bytes at most (0: as many as there are), what it holds.
MESSAGES = (
    ("tiny", 0, (access_point,)),
    ("small", 0, (access_point, browser, messaging)),
    ("typical", 0, TYPICAL),
    ("2k", 2 << 10, ROUND),
    ("8k", 8 << 10, ROUND),
    ("29k", 29 << 10, ROUND),
    ("200k", 200 << 10, ROUND),
    ("1m", 1 << 20, ROUND),
)
TABLES = ("typical", "2k", "29k", "1m")
NAMES = tuple(name for name, _, _ in MESSAGES)


# --- Documents ---------------------------------------------------------------------------------------


def add(document, parent, characteristic):
    kind, parms, nested = characteristic
    element = document.createElement("characteristic")
    element.setAttribute("type", kind)
    for name, value in parms:
        parm = document.createElement("parm")
        parm.setAttribute("name", name)
        if value is not None:
            parm.setAttribute("value", value)
        element.appendChild(parm)
    for child in nested:
        add(document, element, child)
    parent.appendChild(element)


def message(encode, kinds, count, strings):
    """The message with the first `count` characteristics, taken from `kinds` in turn, and its body."""
    document = getDOMImplementation().createDocument(None, "wap-provisioningdoc", None)
    root = document.documentElement
    root.setAttribute("version", "1.0")
    if len(kinds) > 5:
        add(document, root, client(1))
    for n in range(count):
        add(document, root, kinds[n % len(kinds)](n + 1))
    options = {name: default for name, default, _, _ in encode.OPTIONS}
    options["strings"] = strings
    options.update(sec="netwpin", imsi="262011234567890")
    body = encode.encode_body(root, options)
    return encode.encode_push(options, body), body


def longest(encode, kinds, size, strings):
    """The longest such message of at most `size` bytes, or nearly."""
    count = len(kinds)
    short = message(encode, kinds, count, strings)
    while len(short[0]) > size:
        count -= 1
        short = message(encode, kinds, count, strings)
    more = (size - len(short[0])) * count // len(short[0])
    while more > 0:
        tried = message(encode, kinds, count + more, strings)
        if len(tried[0]) <= size:
            count, short = count + more, tried
            more = (size - len(short[0])) * count // len(short[0])
        else:
            more = more * 15 // 16
    return short


def main():
    folder = Path(sys.argv[1]) if len(sys.argv) > 1 else ROOT / "build" / "bench"
    folder.mkdir(parents=True, exist_ok=True)
    encode = encoder()
    for name, size, kinds in MESSAGES:
        strings = "table" if name in TABLES else "inline"
        if size:
            push, body = longest(encode, kinds, size, strings)
        else:
            push, body = message(encode, kinds, len(kinds), strings)
        (folder / f"{name}.push").write_bytes(push)
        (folder / f"{name}.wbxml").write_bytes(body)
        lines = floor.operations(push)
        (folder / f"{name}.floor").write_text("\n".join(lines) + "\n", encoding="ascii")
        print(f"{name}: {len(push)} bytes")


if __name__ == "__main__":
    main()
