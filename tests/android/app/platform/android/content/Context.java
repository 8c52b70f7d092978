package android.content;

public abstract class Context {}
