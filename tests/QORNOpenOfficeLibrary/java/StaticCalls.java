import veltra_qorn.QORN_OoLibrary;

/** Calls the native methods from Java, where they are declared static. */
final class StaticCalls implements Runnable {
    private final String[] folders;
    private final int flag;
    private int result = -1;

    private StaticCalls(String[] folders, int flag) {
        this.folders = folders;
        this.flag = flag;
    }

    static int initialize(String[] folders, int flag) {
        return QORN_OoLibrary.initializeLibrary(
                folders[0], folders[1], folders[2], folders[3], folders[4], flag);
    }

    static int initializeOnSmallStack(String[] folders, int flag)
            throws InterruptedException {
        StaticCalls call = new StaticCalls(folders, flag);
        Thread thread = new Thread(null, call, "small stack", 256 * 1024);
        thread.start();
        thread.join();
        return call.result;
    }

    static int version() {
        return QORN_OoLibrary.getLibraryVersion();
    }

    static int start() {
        return QORN_OoLibrary.startSuppressingDialogs();
    }

    static int stop() {
        return QORN_OoLibrary.stopSuppressingDialogs();
    }

    @Override
    public void run() {
        result = initialize(folders, flag);
    }
}
