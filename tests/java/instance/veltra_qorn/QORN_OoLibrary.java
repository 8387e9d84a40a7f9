package veltra_qorn;

/** The class as it may be declared too: the library doesn't care whether a method is static. */
public final class QORN_OoLibrary {
    public native int initializeLibrary(
            String folder1,
            String folder2,
            String folder3,
            String folder4,
            String folder5,
            int flag);

    public native int getLibraryVersion();

    public native int startSuppressingDialogs();

    public native int stopSuppressingDialogs();
}
