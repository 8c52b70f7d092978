package com.qvomacp.cli;
@picocli.CommandLine.Command(name = "verify")
final class Verify extends Job { void begin() {} void run(Source s) {} }
