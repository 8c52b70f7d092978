/** A module that asks both the reader and the library. */
module example.both {
    requires com.qvomacp.eng.omacp;
    requires com.qvomacp.eng.parser;
}
