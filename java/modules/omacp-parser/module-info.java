/** The ten classes whose natives the library answers, and what loads it. */
module com.qvomacp.eng.parser {
    exports com.qvomacp.eng.parser;
}
