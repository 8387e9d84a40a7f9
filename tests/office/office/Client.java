package office;

import com.sun.star.beans.NamedValue;
import com.sun.star.bridge.UnoUrlResolver;
import com.sun.star.bridge.XUnoUrlResolver;
import com.sun.star.comp.helper.Bootstrap;
import com.sun.star.connection.NoConnectException;
import com.sun.star.deployment.DeploymentException;
import com.sun.star.deployment.ExtensionManager;
import com.sun.star.deployment.XExtensionManager;
import com.sun.star.frame.Desktop;
import com.sun.star.frame.XDesktop2;
import com.sun.star.lang.DisposedException;
import com.sun.star.task.XInteractionApprove;
import com.sun.star.task.XInteractionContinuation;
import com.sun.star.task.XInteractionHandler;
import com.sun.star.task.XJob;
import com.sun.star.ucb.XCommandEnvironment;
import com.sun.star.ucb.XProgressHandler;
import com.sun.star.uno.UnoRuntime;
import com.sun.star.uno.XComponentContext;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.Arrays;
import java.util.Set;
import java.util.TreeSet;
import java.util.regex.Pattern;
import java.util.stream.Collectors;
import java.util.stream.Stream;

/**
 * Talks to a running office from outside of it, and ends it.
 *
 * <p>{@code java office.Client <pipe> <process that started the office> <seconds> <task>...} waits as
 * long for the office at most. The tasks: {@code add=<URL>} and {@code remove} the extension;
 * {@code call} lets it call the library; {@code gone} looks that it is not there.
 *
 * <p>Exits with 0 where all is as promised, with 1 and a line that says what is not, or with 3 where
 * the office cannot be reached.
 */
public final class Client {
    private static final String SERVICE = "org.example.QornCaller";
    private static final String EXTENSION = "org.example.qorn-caller";
    private static final long PAUSE_IN_MS = 100;

    /** What the library may bring along that the office has not loaded by itself. */
    private static final Pattern EXPECTED =
            Pattern.compile(".*/lib(icu(data|i18n|uc)|plist-2\\.0)\\.so\\.[0-9.]+");

    /** Says yes to whatever the office asks about the extension. */
    private static final XInteractionHandler APPROVAL =
            request -> {
                for (XInteractionContinuation answer : request.getContinuations()) {
                    XInteractionApprove yes =
                            UnoRuntime.queryInterface(XInteractionApprove.class, answer);
                    if (yes != null) {
                        yes.select();
                    }
                }
            };

    private static final XCommandEnvironment APPROVING =
            new XCommandEnvironment() {
                @Override
                public XInteractionHandler getInteractionHandler() {
                    return APPROVAL;
                }

                @Override
                public XProgressHandler getProgressHandler() {
                    return null;
                }
            };

    private static final int[] FLAGS = {0, 1, Integer.MIN_VALUE};

    private static final String[][] FOLDERS = {
        {"/home/ada", "/home/ada/Desktop", "/home/ada/Documents", "/tmp", "/"},
        {"/Gr\u00F6\u00DFe", "/e\u0301", "/\u6771\u4EAC", "/\uD83D\uDC6A", ""},
        {"\uD800", "/a\u0000b", "a".repeat(10_000), "\uD83D\uDC6A".repeat(5_000), "//"},
    };

    private final XComponentContext office;
    private XJob caller;

    private Client(XComponentContext office) {
        this.office = office;
    }

    public static void main(String[] arguments) throws Exception {
        XComponentContext office =
                reach(arguments[0], Long.parseLong(arguments[1]), Long.parseLong(arguments[2]));
        if (office == null) {
            end(3, "the office cannot be reached");
        }
        String complaint = "";
        try {
            Client client = new Client(office);
            for (String task : Arrays.asList(arguments).subList(3, arguments.length)) {
                client.run(task);
            }
        } catch (Failure failure) {
            complaint = failure.getMessage();
        }
        if (!terminate(office) && complaint.isEmpty()) {
            complaint = "the office refuses to end";
        }
        end(complaint.isEmpty() ? 0 : 1, complaint);
    }

    /** At once: the bridge to the office keeps threads that would hold this machine up. */
    private static void end(int status, String complaint) {
        if (!complaint.isEmpty()) {
            System.out.println(complaint);
        }
        System.out.flush();
        Runtime.getRuntime().halt(status);
    }

    /** Null where the office ends before it can be reached, or does not listen in time. */
    private static XComponentContext reach(String pipe, long starter, long seconds)
            throws Exception {
        XUnoUrlResolver resolver =
                UnoUrlResolver.create(Bootstrap.createInitialComponentContext(null));
        long end = System.currentTimeMillis() + 1000 * seconds;
        while (System.currentTimeMillis() < end
                && ProcessHandle.of(starter).map(ProcessHandle::isAlive).orElse(false)) {
            try {
                Object context =
                        resolver.resolve("uno:pipe,name=" + pipe + ";urp;StarOffice.ComponentContext");
                return UnoRuntime.queryInterface(XComponentContext.class, context);
            } catch (NoConnectException error) {
                Thread.sleep(PAUSE_IN_MS);
            }
        }
        return null;
    }

    private static boolean terminate(XComponentContext office) {
        try {
            XDesktop2 desktop = Desktop.create(office);
            return desktop.terminate();
        } catch (DisposedException error) {
            // It was quicker to end than to answer.
            return true;
        }
    }

    private void run(String task) throws Failure {
        try {
            if (task.startsWith("add=")) {
                manager().addExtension(task.substring(4), new NamedValue[0], "user", null, APPROVING);
            } else if (task.equals("remove")) {
                manager().removeExtension(EXTENSION, "", "user", null, APPROVING);
            } else if (task.equals("gone")) {
                require(component() == null, "the extension is still there");
            } else if (task.equals("call")) {
                useLibrary();
            } else {
                throw new Failure("there is no task " + task);
            }
        } catch (DisposedException error) {
            throw new Failure("the office ended during the task " + task);
        } catch (DeploymentException error) {
            throw new Failure(task + ": " + error.getMessage() + ": " + error.Cause);
        } catch (com.sun.star.uno.Exception error) {
            throw new Failure(task + ": " + error);
        }
    }

    private XExtensionManager manager() {
        return ExtensionManager.get(office);
    }

    private XJob component() throws com.sun.star.uno.Exception {
        return UnoRuntime.queryInterface(
                XJob.class, office.getServiceManager().createInstanceWithContext(SERVICE, office));
    }

    private void useLibrary() throws Failure, com.sun.star.uno.Exception {
        caller = component();
        require(caller != null, "the extension is not there");
        // What was added to a running office runs in a helper beside it until the next start.
        require(
                program().equals(Paths.get("soffice.bin")),
                "the extension runs in " + program() + ", not in the office");
        Set<String> before = mappedFiles();
        call("load");
        callAll();
        Set<String> after = mappedFiles();
        after.removeAll(before);
        require(
                after.removeIf(file -> file.endsWith("/libQORNOpenOffice.jnilib")),
                "the library is not in the office's process");
        after.removeIf(file -> EXPECTED.matcher(file).matches());
        require(after.isEmpty(), "the library brings along " + after);
    }

    private void callAll() throws Failure {
        expect(3, "getLibraryVersion");
        suppressDialogs();
        for (String[] folders : FOLDERS) {
            for (int flag : FLAGS) {
                expect(0, "initializeLibrary", folders, flag);
            }
        }
        expect(3, "getLibraryVersion");
        suppressDialogs();
    }

    /** In pairs, doubled and the wrong way round: every order is allowed. */
    private void suppressDialogs() throws Failure {
        expect(0, "stopSuppressingDialogs");
        expect(0, "startSuppressingDialogs");
        expect(0, "startSuppressingDialogs");
        expect(0, "stopSuppressingDialogs");
    }

    private void expect(int promised, String method, Object... values) throws Failure {
        Object result = call(method, values);
        require(result.equals(promised), method + " gave " + result + ", not " + promised);
    }

    private Object call(String method, Object... values) throws Failure {
        NamedValue[] arguments = new NamedValue[Math.max(1, values.length)];
        arguments[0] = new NamedValue(method, null);
        for (int i = 0; i < values.length; ++i) {
            arguments[i] = new NamedValue(method, values[i]);
        }
        try {
            return caller.execute(arguments);
        } catch (DisposedException error) {
            throw new Failure("the office died of " + method);
        } catch (com.sun.star.uno.Exception | com.sun.star.uno.RuntimeException error) {
            throw new Failure(method + " failed: " + error.getMessage());
        }
    }

    private Path process() throws Failure {
        return Paths.get("/proc/" + call("process"));
    }

    /** The name of the program that the extension runs in. */
    private Path program() throws Failure {
        try {
            return Files.readSymbolicLink(process().resolve("exe")).getFileName();
        } catch (IOException error) {
            throw new Failure("the extension's process cannot be asked: " + error);
        }
    }

    /** The files that the office's process has mapped as programs. */
    private Set<String> mappedFiles() throws Failure {
        try (Stream<String> maps = Files.lines(process().resolve("maps"))) {
            return maps.filter(line -> line.contains("/") && line.contains(" r-xp "))
                    .map(line -> line.substring(line.indexOf('/')))
                    .collect(Collectors.toCollection(TreeSet::new));
        } catch (IOException error) {
            throw new Failure("the office's mappings cannot be read: " + error);
        }
    }

    private static void require(boolean holds, String complaint) throws Failure {
        if (!holds) {
            throw new Failure(complaint);
        }
    }

    private static final class Failure extends Exception {
        private static final long serialVersionUID = 1;

        private Failure(String message) {
            super(message);
        }
    }
}
