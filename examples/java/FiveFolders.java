import java.io.ByteArrayOutputStream;
import java.io.FileDescriptor;
import java.io.FileOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.PrintStream;
import java.nio.ByteBuffer;
import java.nio.charset.CharacterCodingException;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import veltra_qorn.QORN_OoLibrary;

/**
 * Hands folders to the library, five a call, and prints each call with its result.
 *
 * <pre>{@code
 * printf '%s\0' /home/ada /home/ada/Desktop /home/ada/Documents /tmp /srv |
 *     java -cp classes FiveFolders /path/to/libQORNOpenOffice.jnilib
 * }</pre>
 *
 * The folders come in UTF-8 from the standard input, each ended by a NUL, and not as arguments: in
 * the "C" locale a Java machine loses every character of its arguments that is not ASCII.
 *
 * <p>Exits with 0 where every result was the promised one, else with 1.
 */
public final class FiveFolders {
    private static final int[] FLAGS = {0, 1, Integer.MIN_VALUE};

    private static final PrintStream OUT =
            new PrintStream(new FileOutputStream(FileDescriptor.out), true, StandardCharsets.UTF_8);

    private static boolean asPromised = true;

    private FiveFolders() {}

    public static void main(String[] arguments) throws IOException {
        if (arguments.length != 1) {
            fail("usage: java FiveFolders <library> < <folders, each ended by a NUL>");
        }
        try {
            List<String> folders = readFolders(System.in);
            System.load(arguments[0]);
            callAll(folders);
        } catch (CharacterCodingException error) {
            fail("a folder's name is not UTF-8");
        } catch (UnsatisfiedLinkError error) {
            fail("the library cannot be used: " + error.getMessage());
        }
        if (!asPromised) {
            fail("not every result was as promised");
        }
    }

    private static List<String> readFolders(InputStream input) throws IOException {
        List<String> folders = new ArrayList<>();
        ByteArrayOutputStream folder = new ByteArrayOutputStream();
        for (int next = input.read(); next >= 0; next = input.read()) {
            if (next != 0) {
                folder.write(next);
                continue;
            }
            ByteBuffer bytes = ByteBuffer.wrap(folder.toByteArray());
            folders.add(StandardCharsets.UTF_8.newDecoder().decode(bytes).toString());
            folder.reset();
        }
        if (folder.size() != 0 || folders.isEmpty() || folders.size() % 5 != 0) {
            fail("the folders must come by five, each ended by a NUL");
        }
        return folders;
    }

    private static void callAll(List<String> folders) {
        version();
        suppressDialogs();
        for (int first = 0; first < folders.size(); first += 5) {
            for (int flag : FLAGS) {
                initialize(folders.subList(first, first + 5), flag);
            }
        }
        version();
        suppressDialogs();
    }

    private static void version() {
        report("getLibraryVersion()", QORN_OoLibrary.getLibraryVersion(), 3);
    }

    /** In pairs, doubled and the wrong way round: every order is allowed. */
    private static void suppressDialogs() {
        report("stopSuppressingDialogs()", QORN_OoLibrary.stopSuppressingDialogs(), 0);
        report("startSuppressingDialogs()", QORN_OoLibrary.startSuppressingDialogs(), 0);
        report("startSuppressingDialogs()", QORN_OoLibrary.startSuppressingDialogs(), 0);
        report("stopSuppressingDialogs()", QORN_OoLibrary.stopSuppressingDialogs(), 0);
    }

    private static void initialize(List<String> five, int flag) {
        StringBuilder call = new StringBuilder("initializeLibrary(");
        for (String folder : five) {
            call.append(quoted(folder)).append(", ");
        }
        call.append(flag).append(')');
        int result =
                QORN_OoLibrary.initializeLibrary(
                        five.get(0), five.get(1), five.get(2), five.get(3), five.get(4), flag);
        report(call.toString(), result, 0);
    }

    private static void report(String call, int result, int promised) {
        OUT.print(call + " = " + result);
        if (result != promised) {
            OUT.print(", but " + promised + " is promised");
            asPromised = false;
        }
        OUT.println();
    }

    /** One line, whatever the name holds. */
    private static String quoted(String text) {
        StringBuilder quoted = new StringBuilder("\"");
        for (char unit : text.toCharArray()) {
            if (Character.isISOControl(unit)) {
                quoted.append(String.format("\\u%04X", (int) unit));
            } else if (unit == '"' || unit == '\\') {
                quoted.append('\\').append(unit);
            } else {
                quoted.append(unit);
            }
        }
        return quoted.append('"').toString();
    }

    private static void fail(String reason) {
        OUT.flush();
        new PrintStream(new FileOutputStream(FileDescriptor.err), true, StandardCharsets.UTF_8)
                .println("FiveFolders: " + reason);
        System.exit(1);
    }
}
