/** Natives that make the calls of the virtual machine that an answer takes, and nothing else. */
final class Bare {
    /** What the methods below answer: the number, and the others by their places. */
    native void hold(int number, Object[] answers);

    native int number();

    native String text(int place);

    native String[] array(int place);
}
