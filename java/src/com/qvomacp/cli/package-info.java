/** The command-line program that shows what a pushed provisioning message sets. */
package com.qvomacp.cli;
