/** Reads pushed OMA Client Provisioning messages, says what they set, and makes them. */
module com.qvomacp.eng.omacp {
    exports com.qvomacp.eng.omacp;
}
