import java.util.Locale;
import java.util.function.LongSupplier;
import veltra_qorn.QORN_OoLibrary;

/**
 * Times the library's native methods beside empty ones and prints a table: nanoseconds a call, the
 * best of all rounds, and the ratio.
 *
 * <p>{@code java QORNOoLibraryBenchmark <library> <library of the empty methods>}
 */
public final class QORNOoLibraryBenchmark {
    /** A round is short, so that some are not interrupted. */
    private static final int CALLS = 5_000;

    private static final int ROUNDS = 1_000;

    /** Few, because the library keeps the folders of every call. */
    private static final int FOLDER_ROUNDS = 20;

    /** The compiler's last step comes after 60,000 turns of a loop. */
    private static final int WARM_UP_ROUNDS = 16;

    private static final String[] FOLDERS = {
        "/home/ada",
        "/home/ada/Desktop",
        "/home/ada/Documents",
        "/tmp/office-3f9a/instance-0001",
        "/home/ada/.config/office/user/extensions"
    };

    private QORNOoLibraryBenchmark() {}

    public static void main(String[] arguments) {
        System.load(arguments[0]);
        System.load(arguments[1]);
        System.out.printf(
                Locale.ROOT, "%-20s %10s %10s %8s%n", "native method", "ns", "empty, ns", "ratio");
        compare(
                "getLibraryVersion",
                ROUNDS,
                QORNOoLibraryBenchmark::timeVersion,
                QORNOoLibraryBenchmark::timeEmptyPlain);
        compare(
                "initializeLibrary",
                FOLDER_ROUNDS,
                QORNOoLibraryBenchmark::timeInitialize,
                QORNOoLibraryBenchmark::timeEmptyWithFolders);
    }

    private static void compare(String name, int rounds, LongSupplier ours, LongSupplier empty) {
        long best = Long.MAX_VALUE;
        long bestEmpty = Long.MAX_VALUE;
        for (int round = -WARM_UP_ROUNDS; round < rounds; ++round) {
            long time = ours.getAsLong();
            long timeEmpty = empty.getAsLong();
            if (round >= 0) {
                best = Math.min(best, time);
                bestEmpty = Math.min(bestEmpty, timeEmpty);
            }
        }
        System.out.printf(
                Locale.ROOT,
                "%-20s %10.1f %10.1f %8.2f%n",
                name,
                (double) best / CALLS,
                (double) bestEmpty / CALLS,
                (double) best / bestEmpty);
    }

    // Each loop is a method of its own, so that the compiled code has the native call in it.

    private static long timeVersion() {
        long begin = System.nanoTime();
        long sum = 0;
        for (int call = 0; call < CALLS; ++call) {
            sum += QORN_OoLibrary.getLibraryVersion();
        }
        long time = System.nanoTime() - begin;
        expect(sum, 3L * CALLS);
        return time;
    }

    private static long timeEmptyPlain() {
        long begin = System.nanoTime();
        long sum = 0;
        for (int call = 0; call < CALLS; ++call) {
            sum += EmptyNative.plain();
        }
        long time = System.nanoTime() - begin;
        expect(sum, 0);
        return time;
    }

    private static long timeInitialize() {
        long begin = System.nanoTime();
        long sum = 0;
        for (int call = 0; call < CALLS; ++call) {
            sum +=
                    QORN_OoLibrary.initializeLibrary(
                            FOLDERS[0], FOLDERS[1], FOLDERS[2], FOLDERS[3], FOLDERS[4], call);
        }
        long time = System.nanoTime() - begin;
        expect(sum, 0);
        return time;
    }

    private static long timeEmptyWithFolders() {
        long begin = System.nanoTime();
        long sum = 0;
        for (int call = 0; call < CALLS; ++call) {
            sum +=
                    EmptyNative.withFolders(
                            FOLDERS[0], FOLDERS[1], FOLDERS[2], FOLDERS[3], FOLDERS[4], call);
        }
        long time = System.nanoTime() - begin;
        expect(sum, 0);
        return time;
    }

    private static void expect(long sum, long promised) {
        if (sum != promised) {
            throw new AssertionError("the results add up to " + sum + ", not " + promised);
        }
    }
}
