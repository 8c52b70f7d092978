/** A module that reads messages. */
module example.names {
    requires com.qvomacp.eng.omacp;
}
