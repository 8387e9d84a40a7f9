/** Native methods that do nothing, with the arguments of the library's. */
final class EmptyNative {
    private EmptyNative() {}

    static native int plain();

    static native int withFolders(
            String folder1,
            String folder2,
            String folder3,
            String folder4,
            String folder5,
            int flag);
}
