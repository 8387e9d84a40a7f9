package office;

import com.sun.star.beans.NamedValue;
import com.sun.star.deployment.PackageInformationProvider;
import com.sun.star.lang.IllegalArgumentException;
import com.sun.star.lang.XSingleComponentFactory;
import com.sun.star.lib.uno.helper.Factory;
import com.sun.star.lib.uno.helper.WeakBase;
import com.sun.star.task.XJob;
import com.sun.star.uno.XComponentContext;
import java.net.URI;
import java.nio.file.Path;
import java.nio.file.Paths;
import veltra_qorn.QORN_OoLibrary;

/**
 * The extension's component, which lives in the office's process: makes the one call that its first
 * argument names, with the values of those that follow, and returns what came of it.
 */
public final class Caller extends WeakBase implements XJob {
    private static final String EXTENSION = "org.example.qorn-caller";
    private static final String LIBRARY = "libQORNOpenOffice.jnilib";

    private final XComponentContext context;

    public Caller(XComponentContext context) {
        this.context = context;
    }

    /** Where the office looks for the way to make a component. */
    public static XSingleComponentFactory __getComponentFactory(String implementation) {
        return implementation.equals(Caller.class.getName())
                ? Factory.createComponentFactory(
                        Caller.class, new String[] {"org.example.QornCaller"})
                : null;
    }

    @Override
    public Object execute(NamedValue[] arguments)
            throws IllegalArgumentException, com.sun.star.uno.Exception {
        try {
            switch (arguments[0].Name) {
                case "process":
                    return ProcessHandle.current().pid();
                case "load":
                    return load();
                case "getLibraryVersion":
                    return QORN_OoLibrary.getLibraryVersion();
                case "startSuppressingDialogs":
                    return QORN_OoLibrary.startSuppressingDialogs();
                case "stopSuppressingDialogs":
                    return QORN_OoLibrary.stopSuppressingDialogs();
                case "initializeLibrary":
                    return initialize(
                            (String[]) arguments[0].Value, (Integer) arguments[1].Value);
                default:
                    throw new IllegalArgumentException(arguments[0].Name);
            }
        } catch (LinkageError error) {
            throw new com.sun.star.uno.Exception(error.toString(), this);
        }
    }

    /** From the folder into which the office has unpacked the extension. */
    private String load() {
        String folder =
                PackageInformationProvider.get(context).getPackageLocation(EXTENSION);
        Path library = Paths.get(URI.create(folder)).resolve(LIBRARY);
        System.load(library.toString());
        return library.toString();
    }

    private static int initialize(String[] folders, int flag) {
        return QORN_OoLibrary.initializeLibrary(
                folders[0], folders[1], folders[2], folders[3], folders[4], flag);
    }
}
