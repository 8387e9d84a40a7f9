import java.lang.reflect.InvocationTargetException;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import veltra_qorn.QORN_OoLibrary;

/**
 * Calls the real library in this Java machine. Silent while every result is as promised, so that
 * whatever the machine itself complains of stands out.
 *
 * <p>{@code java OoLibraryTest load <file>} or {@code java OoLibraryTest loadLibrary <name>}
 */
public final class OoLibraryTest {
    private static final int[] FLAGS = {0, 1, -1, 256, 0x10000, Integer.MIN_VALUE};
    private static final int LONG = 100_000;
    private static final int MANY_CALLS = 1_000;
    private static final long SMALL_STACK = 1 << 20;

    private static final String[][] FOLDERS = {
        {"/home/ada", "/home/ada/Desktop", "/home/ada/Documents", "/tmp", "/srv"},
        {"", "", "", "", ""},
        {"", "/tmp", "", "/tmp", ""},
        {"/Gr\u00F6\u00DFe", "/e\u0301", "/\u6771\u4EAC", "/\uFEFF", "/\uFFFF"},
        {"/\uD83D\uDC6A", "\uD800\uDC00", "\uDBFF\uDFFF", "/\uD835\uDCAC/x", "\uD83D\uDE00\uD83D\uDE00"},
        {"\uD800", "\uDC00", "/a\uD800b", "\uDC00\uD800", "/\uDBFF\uDBFF\uDFFF"},
        {"/a\u0000b", "\u0000", "/\u0001\u001F\u007F", "//", "/tmp/"},
        {
            "a".repeat(LONG),
            "\u00E9".repeat(LONG),
            "\u6771".repeat(LONG),
            "\uD83D\uDC6A".repeat(LONG / 2),
            "/" + "\uD83D\uDC6A".repeat(LONG / 2)
        },
    };

    private final Object receiver;

    private OoLibraryTest(Object receiver) {
        this.receiver = receiver;
    }

    public static void main(String[] arguments) throws Throwable {
        load(arguments[0], arguments[1]);
        Throwable[] failure = new Throwable[1];
        Thread thread =
                new Thread(
                        null,
                        () -> {
                            try {
                                new OoLibraryTest(receiver()).run();
                            } catch (Throwable error) {
                                failure[0] = error;
                            }
                        },
                        "small stack",
                        SMALL_STACK);
        thread.start();
        thread.join();
        if (failure[0] != null) {
            throw failure[0];
        }
    }

    private static void load(String how, String library) {
        switch (how) {
            case "load":
                System.load(library);
                break;
            case "loadLibrary":
                System.loadLibrary(library);
                break;
            default:
                throw new IllegalArgumentException(how);
        }
    }

    /** Null where the class in use declares its methods static. */
    private static Object receiver() throws ReflectiveOperationException {
        Method method = QORN_OoLibrary.class.getMethod("getLibraryVersion");
        return Modifier.isStatic(method.getModifiers())
                ? null
                : QORN_OoLibrary.class.getConstructor().newInstance();
    }

    private void run() throws Throwable {
        expect(3, "getLibraryVersion");
        suppressDialogs();
        for (String[] folders : FOLDERS) {
            for (int flag : FLAGS) {
                initialize(folders, flag);
            }
        }
        for (int call = 0; call < MANY_CALLS; ++call) {
            initialize(FOLDERS[0], call);
        }
        expect(3, "getLibraryVersion");
        suppressDialogs();
    }

    private void suppressDialogs() throws Throwable {
        expect(0, "stopSuppressingDialogs");
        expect(0, "stopSuppressingDialogs");
        expect(0, "startSuppressingDialogs");
        expect(0, "startSuppressingDialogs");
        expect(0, "stopSuppressingDialogs");
    }

    private void initialize(String[] folders, int flag) throws Throwable {
        expect(
                0,
                "initializeLibrary",
                folders[0],
                folders[1],
                folders[2],
                folders[3],
                folders[4],
                flag);
    }

    private void expect(int promised, String name, Object... arguments) throws Throwable {
        Object result;
        try {
            result = method(name).invoke(receiver, arguments);
        } catch (InvocationTargetException error) {
            throw error.getCause();
        }
        if (!result.equals(promised)) {
            throw new AssertionError(name + " gave " + result + ", not " + promised);
        }
    }

    private static Method method(String name) {
        for (Method method : QORN_OoLibrary.class.getMethods()) {
            if (method.getName().equals(name)) {
                return method;
            }
        }
        throw new AssertionError("there is no method " + name);
    }
}
