import veltra_qorn.QORN_OoLibrary;

public final class FirstSteps {
    public static void main(String[] arguments) {
        System.load(arguments[0]); // the full path of libQORNOpenOffice.jnilib
        System.out.println(QORN_OoLibrary.getLibraryVersion()); // 3
        System.out.println(
                QORN_OoLibrary.initializeLibrary(
                        "/home/ada", "/home/ada/Desktop", "/home/ada/Documents", "/tmp", "/", 0)); // 0
    }
}
