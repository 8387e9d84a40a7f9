/** Declares the native methods without static, and calls them so. */
final class InstanceCalls {
    private native int initializeLibrary(
            String folder1,
            String folder2,
            String folder3,
            String folder4,
            String folder5,
            int flag);

    private native int getLibraryVersion();

    private native int startSuppressingDialogs();

    private native int stopSuppressingDialogs();

    static int initialize(String[] folders, int flag) {
        return new InstanceCalls()
                .initializeLibrary(
                        folders[0], folders[1], folders[2], folders[3], folders[4], flag);
    }

    static int version() {
        return new InstanceCalls().getLibraryVersion();
    }

    static int start() {
        return new InstanceCalls().startSuppressingDialogs();
    }

    static int stop() {
        return new InstanceCalls().stopSuppressingDialogs();
    }
}
