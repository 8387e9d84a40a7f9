package veltra_qorn;

/**
 * The native methods of {@code libQORNOpenOffice.jnilib}. Load the library first, by
 * {@link System#load} with its full path or by {@code System.loadLibrary("QORNOpenOffice")}:
 *
 * <pre>{@code
 * System.load("/opt/office/libQORNOpenOffice.jnilib");
 * QORN_OoLibrary.getLibraryVersion();   // 3
 * }</pre>
 *
 * The library never looks at the receiver, so the methods may as well be declared without
 * {@code static}. Apart from {@link #initializeLibrary} they can be called on any thread.
 */
public final class QORN_OoLibrary {
    private QORN_OoLibrary() {}

    /**
     * Hands five folders to the library, which keeps them in this order; a further call adds five
     * more. Nothing tests whether they exist, and an empty text keeps its place. To be called on
     * one thread at a time.
     *
     * @param folder1 a path, as are the four that follow; never null
     * @param flag accepted and without effect, whatever its value
     * @return 0
     */
    public static native int initializeLibrary(
            String folder1,
            String folder2,
            String folder3,
            String folder4,
            String folder5,
            int flag);

    /**
     * Can be called before {@link #initializeLibrary}.
     *
     * @return 3
     */
    public static native int getLibraryVersion();

    /**
     * Can be called in any order with {@link #stopSuppressingDialogs} and any number of times.
     *
     * @return 0
     */
    public static native int startSuppressingDialogs();

    /** @return 0 */
    public static native int stopSuppressingDialogs();
}
