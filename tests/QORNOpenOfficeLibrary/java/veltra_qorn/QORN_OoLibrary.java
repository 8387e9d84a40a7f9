package veltra_qorn;

/** The class whose native methods the library exports. */
public final class QORN_OoLibrary {
    private QORN_OoLibrary() {}

    public static native int initializeLibrary(
            String folder1,
            String folder2,
            String folder3,
            String folder4,
            String folder5,
            int flag);

    public static native int getLibraryVersion();

    public static native int startSuppressingDialogs();

    public static native int stopSuppressingDialogs();
}
