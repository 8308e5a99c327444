// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/leases/irregularleases.h"

#include <QRandomGenerator>

#include <array>

namespace {

constexpr std::array usualLines{
    "  starts 6 2026/11/21 01:05:30;",
    "  starts 5 2024/02/29 23:59:59;",
    "  ends 6 2026/11/21 01:15:30;",
    "  ends 0 2023/02/28 00:00:00;",
    "  tstp 6 2026/11/21 01:15:30;",
    "  tsfp 6 2026/11/21 01:15:30;",
    "  atsfp 6 2026/11/21 01:15:30;",
    "  cltt 6 2026/11/21 01:05:30;",
    "  binding state active;",
    "  binding state free;",
    "  binding state abandoned;",
    "  next binding state free;",
    "  rewind binding state expired;",
    "  hardware ethernet 00:0c:01:02:03:04;",
    "  hardware ethernet d0:67:e5:44:e8:48;",
    R"(  uid "\001\000\014\001\002\003\004";)",
    R"(  uid "\001<{\007T}\030#\"\\";)",
    R"(  client-hostname "alpha";)",
    R"(  client-hostname "beta-2";)",
    R"(  set vendor-class-identifier = "MSFT 5.0";)",
    R"(  set ddns-rev-name = "3.0.0.10.in-addr.arpa.";)",
    R"(  set ddns-txt = "31fc52937881fd732aa9c3c07e2333679a";)",
    R"(  set ddns-dhcid = "\242\344}\304\2430{IJ\"\204\\";)",
    R"(  set hardware-of-client = "00:0c:01:02:03:04";)",
    R"(  option agent.circuit-id "}{";)",
    "  option agent.remote-id 0:6:0:1a:a1:2b:3c:4d;",
};

constexpr std::array irregularLines{
    "",
    " ",
    "}",
    "  }",
    "{",
    "} {",
    "lease 10.0.0.7 {",
    "lease 10.0.0.7 { starts 6 2026/11/21 01:05:30; }",
    "lease 2001:db8::1 {",
    "lease ::ffff:10.0.0.3 {",
    "lease 0.0.0.0 {",
    "lease 010.0.0.1 {",
    "lease 10.1 {",
    "lease 10 {",
    "lease 300.0.0.1 {",
    "lease 10.0.0.1. {",
    "lease 10.0.0 {",
    "lease  {",
    "lease {",
    "lease\t10.0.0.9 {",
    "lease 10.0.0.4\t{",
    "\tstarts 6 2026/11/21 01:05:30;",
    "failover peer \"partner\" state {",
    "  my state normal at 6 2012/03/17 05:38:52;",
    "host ten.example.com {",
    "  ends never;",
    "  starts never;",
    "ends 6 2026/11/21 01:15:30;",
    "starts 6 2026/11/21 01:15:30;",
    "  ends 6 2026/11/21 01:15:30",
    "  ends 6 2026/11/21",
    "  ends 6",
    "  ends",
    "  ends 6 2026/02/29 01:15:30;",
    "  ends 6 2026/13/01 01:15:30;",
    "  ends 6 2026/11/21 24:15:30;",
    "  ends 6 2026/11/21 +1:15:30;",
    "  ends 6 0000/11/21 11:15:30;",
    "  ends 6 0001/01/01 11:15:30;",
    "  ends 6 2026/11/21 11:15:30; }",
    "  ends x 2026/11/21 11:15:30;",
    "  ends  2026/11/21 11:15:30;",
    "  ends epoch 1234567890; # Fri Feb 13 23:31:30 2009",
    "  starts 6 2026/1a/21 01:05:30;",
    "  starts 6 2026-11-21 01:05:30;",
    "  starts 6 2026/11/21 01:05:3\xd9\xa3;",
    "  cltt 6 2026/11/21 01:05:30; ends 6 2026/11/22 01:15:30;",
    "  cltt 6 2026/11/21 0{:05:30;",
    "  tstp ends;",
    "  binding state;",
    "  binding state ",
    "  binding state active; {",
    "  binding state active; # {",
    "  binding state active; }",
    "  binding state caf\xc3\xa9",
    "  binding state caf\xe9",
    "  binding state next;",
    "  binding state very strange;",
    "binding state active;",
    "  next binding state ends;",
    "  next binding state active; starts 6 2026/11/21 01:05:30;",
    "  rewind binding state free; }",
    "  next binding state hardware;",
    "  rewind binding state free; {",
    "  hardware",
    "  hardware ethernet",
    "  hardware ethernet ",
    "  hardware ethernet 00:0c:01:02:03:04",
    "  hardware ethernet 00:0c:01:02:03:04; {",
    "  hardware ethernet 00:0c:01:02:03:04; \"{\"",
    "  hardware ethernet 00:0c:01:02:03:04; # {",
    "  hardware ethernet \xc3\xa9",
    "  hardware token-ring 1 2 3;",
    "hardware ethernet 1:2:3:4:5:6;",
    "  uid 01:00:0c:01:02:03:04;",
    R"(  uid "hardware ethernet starts ends";)",
    R"(  uid "unfinished {)",
    R"(  uid "escaped\" } end\\";)",
    R"(  uid "escaped\\" } ;)",
    R"(  uid "a" hardware b "c";)",
    R"(  uid "a" } "c";)",
    R"(  hard"x"ware "";)",
    R"(  client-hostname "with space";)",
    R"(  client-hostname "with  two  spaces" ;)",
    R"(  client-hostname "a;b{c}";)",
    R"(  client-hostname "hardware";)",
    R"(  client-hostname "";)",
    R"(  client-hostname "\"quoted\"";)",
    R"(  client-hostname "slash\\";)",
    R"(  client-hostname "slash\\\";)",
    R"(  client-hostname "unfinished name)",
    R"(  client-hostname "a" "b";)",
    R"(  client-hostname x"a b";)",
    R"(  client-hostname #"a b";)",
    R"(  "client-hostname "a b";)",
    "  client-hostname bare;",
    "  client-hostname b;",
    "  client-hostname",
    "client-hostname \"early\";",
    "  client-hostname \"caf\xc3\xa9\";",
    "  client-hostname \"caf\xe9\";",
    "  client-hostname \xe9\xe9\xe9\xe9;",
    "  client-hostname \xc3\xa9\xc3\xa9\xc3\xa9;",
    "# lease 10.0.0.250 {",
    "#}",
    "  # hardware ethernet no;",
    "  starts 6 2026/11/21 01:05:30; # ends }",
    "  set x = 5;",
    "  set x = 1:2:3:4:5;",
    R"(  set x = "a";)",
    R"(  set x = "a" ;)",
    "  set x;",
    "  set x = ;",
    "  set ;",
    "  set starts 2026/11/22 01:02:03;",
    "  set ends 1:2;",
    "  set x = 1:2;}",
    "  set #x = 1:2;",
    "  option ends 1:2;",
    "  option agent.circuit-id 1:2:3}",
    "  option hardware-of-agent 1:2:3;",
    "  option {agent.circuit-id 1:2:3;",
    R"(  set x = "a";b;)",
    R"(  set x = "a)",
    R"(  set x = "a; })",
    R"(  set x = "a"; })",
    R"(  set x = "a"; } "b";)",
    R"(  set x = "} {" "} {";)",
    R"(  set { = "a";)",
    R"(  set } = "a";)",
    R"(  set ends = "a";)",
    R"(  set ends 2026/11/22 01:02:03; "a";)",
    R"(  set starts 2026/11/22 01:02:03; "a";)",
    R"(  set # = "a"; })",
    R"(  set client-hostname "a";)",
    R"(  set x-client-hostname "b";)",
    R"(  set binding state = "c";)",
    R"(  set a-name-that-is-longer-than-any-other-name-in-a-file-of-leases = "a";)",
};

template<std::size_t size>
QByteArray oneOf(const std::array<const char *, size> &lines, QRandomGenerator &random)
{
    return lines.at(static_cast<std::size_t>(random.bounded(static_cast<int>(size))));
}

QByteArray changed(QByteArray line, QRandomGenerator &random)
{
    static const QByteArray bytes{QByteArrayLiteral("{}\"\\# ;\t\r\0\xff\xc3") + QByteArrayLiteral("a0:/.")};
    const QByteArray::size_type place{random.bounded(line.size() + 1)};
    const char byte{bytes[random.bounded(bytes.size())]};
    switch (random.bounded(4)) {
    case 0:
        return line.insert(place, byte);
    case 1:
        return line.remove(place, 1);
    case 2:
        return line.left(place);
    default:
        return place < line.size() ? line.replace(place, 1, &byte, 1) : line;
    }
}

} // namespace

QByteArray irregularLeaseFile(QRandomGenerator &random)
{
    QByteArray text;
    const auto add = [&](const QByteArray &line) {
        text += random.bounded(20) == 0 ? changed(line, random) : line;
        if (random.bounded(60) != 0)
            text += random.bounded(40) == 0 ? "\r\n" : "\n";
    };
    const int blocks{random.bounded(1, 8)};
    for (int block{0}; block < blocks; ++block) {
        add("lease 10.0." + QByteArray::number(random.bounded(2)) + '.' + QByteArray::number(random.bounded(6)) + " {");
        const int lines{random.bounded(10)};
        for (int line{0}; line < lines; ++line)
            add(random.bounded(3) == 0 ? oneOf(irregularLines, random) : oneOf(usualLines, random));
        add("}");
    }
    return random.bounded(4) == 0 ? text.left(random.bounded(text.size() + 1)) : text;
}

QByteArray leaseBlock(int third, int fourth, int version)
{
    const QByteArray number{QByteArray::number(version)};
    const QByteArray second{QByteArray::number(10 + version % 50)};
    return "lease 10.0." + QByteArray::number(third) + '.' + QByteArray::number(fourth) + " {\n" +
           "  starts 6 2026/11/21 01:05:" + second + ";\n  ends 6 2026/11/21 01:15:" + second + ";\n" +
           "  binding state " + (version % 2 == 0 ? "active" : "free") + ";\n  next binding state free;\n" +
           "  hardware ethernet 00:0c:01:02:03:" + second + ";\n  uid \"\\001\\000{" + number + "\";\n" +
           "  client-hostname \"host-" + number + "\";\n}\n";
}
