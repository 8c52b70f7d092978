/** Natives that make the calls of the virtual machine that an answer takes, and nothing else. */
final class Bare {
    /** What the methods below answer. */
    native void keep(int number, String text, String[] array);

    native int number();

    native String text(int index);

    native String[] array(int index);
}
