#!/usr/bin/env python3
"""Holds the model to cases that are known by hand, and its two ways of answering to each other."""

import sys
import unittest

sys.dont_write_bytecode = True

import natives
import push
from decoder import Decoder, decode
from documents import integer
from generate import Generator
from omacp_model import HEADER_ONLY, Message, Session
from reader import EXHAUSTED, FAILED, TOO_MUCH_TEXT, UNKNOWN_ELEMENT, WRONG_TYPE
from vocabulary import DOCUMENT_TYPE

MAC = b"0BB3BB551F0A93359EC29E6CEAC1440E4A617489"


def text(value):
    return b"\x03" + value + b"\0"


def parm(token, *value):
    """A PARM; a NAME token alone when no value is given."""
    return b"\x87" + bytes((token,)) + (b"\x06" + b"".join(value) if value else b"") + b"\x01"


def named(name, *value):
    return b"\x87\x05" + text(name) + (b"\x06" + b"".join(value) if value else b"") + b"\x01"


def characteristic(kind, *content):
    return b"\xc6" + kind + b"\x01" + b"".join(content) + b"\x01"


def document(*content, table=b""):
    header = b"\x03\x0b\x6a" + integer(len(table)) + table
    return header + b"\xc5\x46\x01" + b"".join(content) + b"\x01"


def pushed(body):
    return b"\x01\x06\x01\xb6" + body


def parsed(*content, table=b""):
    session = Session()
    if not session.parse(Message(pushed(document(*content, table=table)))):
        raise AssertionError("refused with %s" % session.code)
    return session


def code_of(*content, table=b""):
    return decode(document(*content, table=table))[0]


def first(chain, *content, table=b""):
    return parsed(*content, table=table).root[chain][0]


PX_LOGICAL_TYPE, PX_PHYSICAL_TYPE, PORT_TYPE = b"\x51", b"\x52", b"\x53"
NAP_DEF_TYPE, BOOTSTRAP_TYPE, VENDOR_TYPE = b"\x55", b"\x56", b"\x57"
PX_AUTH_TYPE, CLIENT_TYPE, NAP_AUTH_TYPE, ACCESS_TYPE = b"\x59", b"\x58", b"\x5a", b"\x5b"
APPLICATION_TYPE = b"\x00\x01\x55"
APP_AUTH_TYPE, RESOURCE_TYPE = b"\x57", b"\x59"  # on the page that APPLICATION switched to


def type_text(name):
    return b"\x50" + text(name)


class PushHeader(unittest.TestCase):
    def test_whole_header(self):
        header = push.parse(b"\x01\x06\x2f\x1f\x2d\xb6\x91\x81\x92" + MAC + b"\0" + b"BODY")
        self.assertEqual((54, 47, 0x81, MAC), self.facts(header))
        self.assertEqual(b"BODY", header.body)

    @staticmethod
    def facts(header):
        return header.content_type, header.header_length, header.sec, header.mac

    def test_no_length_quote(self):
        self.assertEqual((54, 1, 0, b""), self.facts(push.parse(b"\x01\x06\x01\xb6\x03\x0b")))

    def test_rejected(self):
        for message in (
            b"",
            b"\x01\x06\x00",
            b"\x01\x07\x01\xb6",
            b"\x01\x06\x02\xb6",
            b"\x01\x06\x00\x1f",
            b"\x01\x06\x01\x05\x00",
            b"\x01\x06\x01APPLICATION/VND.WAP.CONNECTIVITY-WBXML\0",
            b"\x01\x06\x01application/vnd.wap.connectivity-wbxml",
            b"\x01\x06\x01" + b"a" * 64 + b"\0",
            b"\x01\x06\x01\xb6\x92" + b"1" * 44 + b"\0",
            b"\x01\x06\x01\xb6\x92" + b"1" * 40,
        ):
            self.assertIsNone(push.parse(message), message)

    def test_text_names(self):
        header = push.parse(
            b"\x01\x06\x01application/vnd.wap.connectivity-wbxml\0sec\0\x80mac\0AB\0"
        )
        self.assertEqual((54, 1, 0x80, b"AB"), self.facts(header))

    def test_short_form_without_high_bit(self):
        header = push.parse(b"\x01\x06\x01\x36\x91\x81\x00")
        self.assertEqual((54, 1, 0x81, b""), self.facts(header))
        self.assertEqual((54, 1, 0, b""), self.facts(push.parse(b"\x01\x06\x01\x36")))
        self.assertEqual(68, push.parse(b"\x01\x06\x01" + b"D" * 64 + b"\0").content_type)

    def test_value_past_the_end(self):
        self.assertEqual((54, 2, 0, b""), self.facts(push.parse(b"\x01\x06\x02\xb6\x91")))
        self.assertEqual((54, 2, 0, b""), self.facts(push.parse(b"\x01\x06\x02\xb6\x92")))

    def test_mac_before_sec(self):
        header = push.parse(b"\x01\x06\x01\xb6\x92AB\0\x91\x81")
        self.assertEqual((54, 1, 0, b"AB"), self.facts(header))


class WbxmlHeader(unittest.TestCase):
    def test_public_identifier(self):
        end = b"\xc6\x51\x01\x01\x01"
        named_type = b"\x03\x00\x00\x6a" + integer(len(DOCUMENT_TYPE) + 1) + DOCUMENT_TYPE
        self.assertEqual(0, decode(b"\x03\x0b\x6a\x00" + end)[0])
        self.assertEqual(WRONG_TYPE, decode(b"\x03\x01\x6a\x00" + end)[0])
        self.assertEqual(0, decode(named_type + b"\0" + end)[0])
        self.assertEqual(WRONG_TYPE, decode(named_type.lower() + b"\0" + end)[0])
        self.assertEqual(WRONG_TYPE, decode(b"\x03")[0])
        self.assertEqual(0, decode(b"\x03\x80\x80\x80\x80\x0b\x6a\x00" + end)[0])
        self.assertEqual(WRONG_TYPE, decode(b"\x03\x80\x80\x80\x80\x80\x0b\x6a\x00" + end)[0])

    def test_header_that_is_cut_or_broken(self):
        end = b"\xc6\x51\x01\x01\x01"
        # The charset fails: the body begins behind its five bytes, without a table.
        self.assertEqual(0, decode(b"\x03\x0b" + b"\x80" * 5 + end)[0])
        # A length above what a table can have: no table, the body follows.
        self.assertEqual(0, decode(b"\x03\x0b\x6a\x8f\xff\xff\xff\x7e" + end)[0])
        # A table longer than what is left takes it all.
        self.assertEqual(EXHAUSTED, decode(b"\x03\x0b\x6a\x7f" + end)[0])

    def test_integer(self):
        def read(data):
            return Decoder(data).integer()

        self.assertEqual(0, read(b"\x00"))
        self.assertEqual(0xA0, read(b"\x81\x20"))
        self.assertEqual(0xFFFFFFFF, read(b"\xff\xff\xff\xff\x7f"))
        self.assertIsNone(read(b"\xff\xff\xff\xff\xff"))
        self.assertIsNone(read(b"\x81"))


class Values(unittest.TestCase):
    @staticmethod
    def value(*pieces, table=b""):
        record = first(
            "ptNapDef", characteristic(NAP_DEF_TYPE, parm(0x11, *pieces)), table=table
        )
        return record.get("pszNapId")

    def test_one_token(self):
        for token, expected in (
            (0x90, b"ANALOG-MODEM"),
            (0x91, b"HTTP"),
            (0x92, b"BASIC"),
            (0x93, b"DIGEST"),
            (0x94, b"BIT-TRANSPARENT"),
            (0x85, b"IPV4"),
            (0x9E, b"WTLS_SS"),
            (0x8D, b"\x8d"),
            (0xFE, b"\xfe"),
        ):
            self.assertEqual(expected, self.value(bytes((token,))))

    def test_joins(self):
        self.assertEqual(b"IPV4IPV4", self.value(text(b""), b"\x85\x85"))
        self.assertEqual(b"a,PAP,CHAP", self.value(text(b"a"), b"\x9a\x9b"))
        self.assertEqual(b"a,HTTP,BASIC", self.value(text(b"a"), b"\x91\x92"))
        self.assertEqual(b"a", self.value(text(b"a"), b"\x94"))
        self.assertEqual(b"abcd", self.value(text(b"ab"), b"\x83\x03", table=b"xx\0cd\0"))

    def test_references(self):
        self.assertEqual(b"", self.value(b"\x83\x00"))
        self.assertEqual(b"", self.value(b"\x83\x01"))
        with self.assertRaises(AssertionError):
            self.value(b"\x83\x02")
        self.assertEqual(b"b", self.value(b"\x83\x01", table=b"ab"))
        with self.assertRaises(AssertionError):
            self.value(b"\x83\x02", table=b"ab")

    def test_opaque(self):
        self.assertEqual(b"ab", self.value(b"\xc3\x02ab"))
        self.assertEqual(b"a", self.value(b"\xc3\x03a\0b"))
        with self.assertRaises(AssertionError):
            self.value(b"\xc3\x8f\xff\xff\xff\x7fab")

    def test_none(self):
        self.assertIsNone(self.value())
        self.assertIsNone(self.value(b""))
        self.assertIsNone(self.value(b"\x2a"))  # skipped up to END


class Parms(unittest.TestCase):
    def domains(self, *parms):
        return first("ptPxLogical", characteristic(PX_LOGICAL_TYPE, *parms)).get("ptDomain")

    def test_repeated(self):
        domains = self.domains(parm(0x17, text(b"a")), parm(0x17), parm(0x17, text(b"b")))
        self.assertEqual([b"a", b"b"], domains)
        proxy = characteristic(PX_LOGICAL_TYPE, parm(0x15, text(b"a")), parm(0x15, text(b"b")))
        self.assertEqual(b"b", first("ptPxLogical", proxy)["pszProxyId"])
        proxy = characteristic(PX_LOGICAL_TYPE, parm(0x15, text(b"a")), parm(0x15))
        self.assertNotIn("pszProxyId", first("ptPxLogical", proxy))

    def test_several_pairs(self):
        pairs = parm(0x17, text(b"a"), b"\x06\x06", text(b"b"))
        self.assertEqual([b"a", b"ab"], self.domains(pairs))
        self.assertEqual([b"a"], self.domains(parm(0x17, b"\xc3\x01a", b"\x17")))
        self.assertEqual([b"a"], self.domains(parm(0x17, b"\xc3\x01a", b"\x17\x06")))
        self.assertEqual([b"a", b"\xfe"], self.domains(parm(0x17, b"\xc3\x01a", b"\x17\x06\xfe")))

    def test_name_as_text_is_refused_where_it_is_not_known(self):
        self.assertEqual(
            UNKNOWN_ELEMENT, code_of(characteristic(PORT_TYPE, named(b"a", text(b"b"))))
        )

    def test_domain_of_px_physical_may_fail(self):
        def physical(*parms):
            inner = characteristic(PX_PHYSICAL_TYPE, *parms)
            return first("ptPxLogical", characteristic(PX_LOGICAL_TYPE, inner))["ptPxPhysical"][0]

        bad = parm(0x17, b"\x83\x7f")
        record = physical(bad, parm(0x20, text(b"1.2.3.4")))
        self.assertEqual({"pszPxAddr": b"1.2.3.4"}, dict(record))
        half = parm(0x17, b"\xc3\x01b\x17\x06\x83\x7f")
        self.assertNotIn("ptDomain", physical(half))
        self.assertEqual([b"a", b"b"], physical(parm(0x17, text(b"a")), half)["ptDomain"])

    def test_init(self):
        def init(*content):
            return first("ptNapDef", characteristic(NAP_DEF_TYPE, *content)).get("pszInit")

        self.assertEqual(b"empty", init(named(b"INIT")))
        self.assertIsNone(init(named(b"INIT", text(b"x"))))
        self.assertIsNone(init(named(b"init")))

    def test_unknown_parm_of_nap_def(self):
        refused = characteristic(NAP_DEF_TYPE, parm(0x37, text(b"x")))
        self.assertEqual(UNKNOWN_ELEMENT, code_of(refused))

    def test_named_parms_of_application(self):
        record = first(
            "ptApplication",
            characteristic(
                APPLICATION_TYPE,
                named(b"FROM", text(b"me")),
                named(b"from", text(b"you")),
                named(b"XCAP_AUID_DCS"),
                parm(0x34, text(b"a")),
                parm(0x34, text(b"b")),
            ),
        )
        self.assertEqual({"pszFrom": b"me", "ptToAddr": [b"a", b"b"]}, dict(record))
        self.assertEqual(FAILED, code_of(characteristic(APPLICATION_TYPE, named(b"", text(b"x")))))

    def test_commas(self):
        def auth_type(*value):
            auth = characteristic(APP_AUTH_TYPE, parm(0x33, *value))
            return first("ptApplication", characteristic(APPLICATION_TYPE, auth))["ptAppAuth"][0][
                "pszAAuthType"
            ]

        self.assertEqual(b"HTTP,x", auth_type(b"\x91\x90", text(b"x")))
        self.assertEqual(b"HTTP,BASIC", auth_type(b"\x91\x90\x92"))
        self.assertEqual(b"AB", auth_type(text(b"A"), b"\x90", text(b"B")))
        self.assertEqual(b"HTTP", auth_type(b"\x91\x90\xfe"))

    def test_start_page(self):
        resource = characteristic(RESOURCE_TYPE, parm(0x1C))
        record = first("ptApplication", characteristic(APPLICATION_TYPE, resource))
        self.assertEqual(b"startpage", record["ptResource"][0]["pszStartPage"])

    def test_access(self):
        content = parm(0x3B, text(b"a")), parm(0x36, text(b"b")), parm(0x3B, text(b"c"))
        record = first("ptAccess", characteristic(ACCESS_TYPE, *content))
        self.assertEqual({"ptRule": [b"a", b"c"], "ptAppId": [b"b"]}, dict(record))

    def test_vendor_config(self):
        record = first(
            "ptVendorConfig",
            characteristic(VENDOR_TYPE, named(b"n", text(b"v")), named(b"m")),
        )
        self.assertEqual({"pszParamName": b"m", "pszParamValue": b"v"}, dict(record))

    def test_wifi(self):
        def wifi(*content):
            return characteristic(type_text(b"WI-FI"), *content)

        self.assertEqual(
            {"pszNetSsid": b"net"}, dict(first("ptWifi", wifi(named(b"NETSSID", text(b"net")))))
        )
        self.assertEqual({}, dict(first("ptWifi", wifi(named(b"NETSSID"), named(b"netssid")))))
        self.assertEqual(UNKNOWN_ELEMENT, code_of(wifi(named(b"netssid", text(b"net")))))
        wrong = characteristic(type_text(b"ROAMING"), parm(0x07, text(b"x")))
        self.assertEqual(UNKNOWN_ELEMENT, code_of(wrong))

    def test_page_switches(self):
        fresh = characteristic(APP_AUTH_TYPE, b"\x87\x00\x05\x31\x06", text(b"n"), b"\x01")
        record = first("ptApplication", characteristic(APPLICATION_TYPE, fresh))
        self.assertEqual(b"n", record["ptAppAuth"][0]["pszAAuthName"])
        # Behind a switch a token is looked at masked: 0x47 is taken for 0x07 and then not found.
        masked = b"\x87\x00\x00\x47\x06" + text(b"1") + b"\x01"
        self.assertEqual(UNKNOWN_ELEMENT, code_of(characteristic(PX_PHYSICAL_TYPE, masked)))
        self.assertEqual(UNKNOWN_ELEMENT, code_of(characteristic(b"\x00\x02\x51")))
        self.assertIn("ptApplication", parsed(characteristic(b"\x00\x41\x55")).root)


class Structure(unittest.TestCase):
    def test_empty_documents(self):
        header = b"\x03\x0b\x6a\x00"
        for body in (b"\x05", b"\x45\x01", b"\x00\x00", b"\x87\x15\x01", b"\x01"):
            self.assertEqual((0, None), decode(header + body)[:2], body)
        self.assertEqual((0, []), decode(header + b"\x45\x06\x01\x01")[:2])
        self.assertEqual(EXHAUSTED, decode(header)[0])
        self.assertEqual(2, decode(b"")[0])
        self.assertEqual(UNKNOWN_ELEMENT, decode(header + b"\x45\x87\x15\x01\x01")[0])

    def test_document_without_root(self):
        self.assertIn("ptPxLogical", self.rootless(b"\x51").root)

    @staticmethod
    def rootless(kind):
        session = Session()
        session.parse(Message(pushed(b"\x03\x0b\x6a\x00" + characteristic(kind) + b"\x01")))
        return session

    def test_nesting(self):
        port = characteristic(PORT_TYPE)
        inside = characteristic(PX_LOGICAL_TYPE, characteristic(PX_PHYSICAL_TYPE, port))
        record = first("ptPxLogical", inside)
        self.assertEqual(1, len(record["ptPxPhysical"][0]["ptPort"]))
        self.assertEqual(UNKNOWN_ELEMENT, code_of(characteristic(BOOTSTRAP_TYPE, port)))
        behind = characteristic(PX_LOGICAL_TYPE, port, parm(0x15, text(b"x")))
        self.assertEqual(UNKNOWN_ELEMENT, code_of(behind))

    def test_child_that_is_not_accepted_ends_the_children(self):
        record = first(
            "ptPxLogical",
            characteristic(
                PX_LOGICAL_TYPE,
                characteristic(PORT_TYPE),
                characteristic(NAP_DEF_TYPE),
                characteristic(PX_AUTH_TYPE),
            ),
        )
        self.assertEqual({"ptPort"}, set(record))

    def test_several_types(self):
        both = parsed(b"\xc6\x51\x55\x01" + parm(0x11, text(b"n")) + b"\x01").root
        self.assertEqual({}, dict(both["ptPxLogical"][0]))
        self.assertEqual({"pszNapId": b"n"}, dict(both["ptNapDef"][0]))
        # Nothing may stand in an element whose last attribute is a page switch.
        self.assertEqual(
            UNKNOWN_ELEMENT, code_of(b"\xc6\x51\x00\x00\x01" + parm(0x15, text(b"x")) + b"\x01")
        )

    def test_second_client_identity(self):
        root = parsed(
            characteristic(CLIENT_TYPE, parm(0x30, text(b"a"))),
            b"\xc6\x51\x57\x5b\x58\x01" + parm(0x30, text(b"b")) + b"\x01",
        ).root
        self.assertEqual([{"pszClientId": b"a"}], [dict(r) for r in root["ptClientIdent"]])
        self.assertEqual({"ptClientIdent", "ptPxLogical"}, set(root))

    def test_dropped_at_the_top(self):
        self.assertEqual({}, dict(parsed(characteristic(PORT_TYPE)).root))

    def test_deep_nesting(self):
        depth = 50000
        self.assertEqual(0, code_of(b"\xc6\x51\x01" * depth + b"\x01" * depth))

    def test_too_much_text(self):
        table = b"x" * 60000 + b"\0"
        reference = parm(0x17, b"\x83\x00")
        self.assertEqual(0, code_of(characteristic(ACCESS_TYPE, reference * 100), table=table))
        much = characteristic(ACCESS_TYPE, reference * 300)
        self.assertEqual(TOO_MUCH_TEXT, code_of(much, table=table))


class Answers(unittest.TestCase):
    @staticmethod
    def answer(session, name, *indexes):
        for native in natives.QUERIES:
            if native.name == "qvomacp_" + name:
                return dict(native.labelled(session.root))[indexes]
        raise KeyError(name)

    def nap_defs(self, *contents):
        return parsed(*(characteristic(NAP_DEF_TYPE, *content) for content in contents))

    def test_missing_proxy(self):
        session = parsed(characteristic(PX_LOGICAL_TYPE))
        self.assertEqual(natives.array([b""] * 14), self.answer(session, "GetProxyData", 2))
        self.assertEqual(natives.array([None] * 14), self.answer(session, "GetProxyData", 1))

    def test_services(self):
        port = characteristic(PORT_TYPE, parm(0x24, b"\xcb"))
        session = parsed(characteristic(PX_LOGICAL_TYPE, port))
        self.assertEqual(
            natives.text(b"CO-WSP"), self.answer(session, "GetPxPortServiceData", 1, 1, 1)
        )
        self.assertEqual(natives.NULL, self.answer(session, "GetPxPortServiceData", 1, 1, 2))

    def test_bearers(self):
        bearers = parm(0x10, b"\xab"), parm(0x10, b"\x99"), parm(0x10, text(b"GSM"))
        session = self.nap_defs(bearers + (parm(0x08, text(b"apn")),))
        answers = [self.answer(session, "GetPxBearerData", 1, d) for d in (1, 2, 3, 4)]
        self.assertEqual(
            [natives.text(t) for t in (b"GSM-GPRS", b"Unkown Bearer", b"apn", None)], answers
        )
        self.assertEqual(natives.number(3), self.answer(session, "GetPxBearerCount", -1))

    def test_auth_types(self):
        for value, expected in (
            (text(b"CHAP"), b"CHAP"),
            (text(b"\x9b"), b"CHAP"),
            (b"\x9e", b"NONE"),
            (b"\xfe", b"NONE"),
        ):
            auth = characteristic(NAP_AUTH_TYPE, parm(0x0C, value))
            session = self.nap_defs((auth,))
            self.assertEqual(
                natives.array([expected, None, None, None, None]),
                self.answer(session, "GetPxNapAuthInfoData", 1, 1),
            )

    def test_address_type_moves_the_array(self):
        def array(*value):
            session = self.nap_defs((parm(0x09, *value), parm(0x0A, text(b"c")), named(b"INIT")))
            return self.answer(session, "GetPxNapDefData", 1)

        none = [None] * 4
        middle = [b"c"] + [None] * 21 + [b"empty"]
        self.assertEqual(natives.array(none + [None] + middle + [None]), array())
        self.assertEqual(natives.array(none + [b"0x8a"] + middle + [None]), array(text(b"\x8ax")))
        self.assertEqual(natives.array(none + middle + [None, b""]), array(b"\x85"))

    def test_select(self):
        session = self.nap_defs((), (parm(0x11, text(b"second")),), ())
        session.select(2)
        self.assertEqual(natives.number(2), self.answer(session, "GetPxNapDefCount"))
        self.assertIn(b"second", self.answer(session, "GetPxNapDefData", 1))
        session.select(5)
        self.assertEqual(natives.number(0), self.answer(session, "GetPxNapDefCount"))

    def test_levels(self):
        for value, expected in ((b"client", b"CLIENT"), (b"appsrv", None), (b"\x8d", b"APPSRV")):
            auth = characteristic(APP_AUTH_TYPE, parm(0x30, text(value)))
            session = parsed(characteristic(APPLICATION_TYPE, auth))
            self.assertEqual(
                natives.array([expected] + [None] * 5),
                self.answer(session, "GetPxAppAuthData", 1, 1),
            )

    def test_only_the_first_roaming_answers(self):
        inside = characteristic(type_text(b"ROAMING"), named(b"SYNC-ALLOWED", text(b"1")))
        second = characteristic(APPLICATION_TYPE), characteristic(b"\x55", inside)
        self.assertEqual(natives.NULL, self.answer(parsed(*second), "GetPxRoamingData"))
        session = parsed(characteristic(APPLICATION_TYPE, inside))
        self.assertEqual(
            natives.array([b"1", None, None]), self.answer(session, "GetPxRoamingData")
        )


class Sessions(unittest.TestCase):
    def test_header_only_leaves_the_context(self):
        session = Session()
        message = pushed(document(characteristic(PX_LOGICAL_TYPE)))
        self.assertTrue(session.parse(Message(message)))
        self.assertTrue(session.parse(Message(message, mode=HEADER_ONLY)))
        self.assertIsNotNone(session.root)
        self.assertFalse(session.parse(Message(b"\x01\x07")))
        self.assertIsNotNone(session.root)
        self.assertFalse(session.parse(Message(pushed(b"\x03"))))
        self.assertIsNone(session.root)

    def test_length_argument(self):
        message = pushed(document(characteristic(PX_LOGICAL_TYPE)))
        for length, expected in (
            (len(message), True),
            (len(message) | 1 << 40, True),
            (len(message) + 1, False),
            (len(message) - 1, False),
            (-1, False),
        ):
            self.assertEqual(expected, Session().parse(Message(message, length)), length)

    def test_registration(self):
        counts = [len(methods) for _, methods in natives.REGISTRATION]
        self.assertEqual([9, 20, 13, 6, 1, 2, 19, 13, 2, 2], counts)

    def test_both_ways_of_answering_agree(self):
        fast, labelled = Session(), Session()
        for message in Generator(1).messages(300):
            answers = [answer for _, answer in labelled.run_labelled(message)]
            self.assertEqual(b"".join(answers), fast.run(message))


if __name__ == "__main__":
    unittest.main()
