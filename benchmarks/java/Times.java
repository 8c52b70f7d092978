import com.qvomacp.eng.parser.XCPCtxNapDef;
import com.qvomacp.eng.parser.XCPCtxParser;
import java.lang.management.ManagementFactory;
import java.lang.management.ThreadMXBean;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.Arrays;
import java.util.Locale;

/**
 * Measures the natives in one virtual machine with what they are compared with. Both sides take
 * turns, after a warm-up; of each the fastest turn counts, in processor time of the thread.
 *
 * <p>Times FOLDER [SECONDS]: the folder of the documents, and how long each pair is measured.
 */
public final class Times {
    private static final double QUERY_LIMIT = 10;
    private static final double ARRAY_LIMIT = 1.1;
    private static final int TURN_NANOSECONDS = 20_000_000;

    /** Something that can be done over and over; what it answers keeps it from being left out. */
    private interface Work {
        int run() throws Exception;
    }

    private static final ThreadMXBean THREADS = ManagementFactory.getThreadMXBean();

    private static int sink;
    private static int misses;

    private final Path folder;
    private final double seconds;
    private final XCPCtxParser parser = new XCPCtxParser();
    private final XCPCtxNapDef napDefs = new XCPCtxNapDef();
    private final Bare bare = new Bare();

    private Times(Path folder, double seconds) {
        this.folder = folder;
        this.seconds = seconds;
    }

    public static void main(String[] arguments) throws Exception {
        System.loadLibrary("omacp");
        System.loadLibrary("bare");
        double seconds = arguments.length > 1 ? Double.parseDouble(arguments[1]) : 4;
        Times times = new Times(Paths.get(arguments[0]), seconds);
        times.answers();
        times.loops();
        System.out.println(misses + " figures miss their limits");
        System.exit(misses == 0 ? 0 : 1);
    }

    /** The times of both in nanoseconds, taking turns. The first half of them is the warm-up. */
    private double[] compare(Work... works) throws Exception {
        int[] rounds = new int[works.length];
        Arrays.fill(rounds, 1);
        double[] least = new double[works.length];
        long start = System.nanoTime();
        long half = start + (long) (seconds * 0.5e9);
        long end = start + (long) (seconds * 1e9);
        boolean warm = false;
        Arrays.fill(least, Double.MAX_VALUE);
        while (System.nanoTime() < end) {
            if (!warm && System.nanoTime() > half) {
                warm = true;
                Arrays.fill(least, Double.MAX_VALUE);
            }
            for (int i = 0; i < works.length; ++i) {
                long before = THREADS.getCurrentThreadCpuTime();
                for (int round = 0; round < rounds[i]; ++round) {
                    sink += works[i].run();
                }
                long taken = THREADS.getCurrentThreadCpuTime() - before;
                least[i] = Math.min(least[i], (double) taken / rounds[i]);
                if (taken < TURN_NANOSECONDS / 2) {
                    rounds[i] *= 2;
                }
            }
        }
        return least;
    }

    private static void row(String format, Object... cells) {
        System.out.println(String.format(Locale.ROOT, format, cells));
    }

    private static String marked(String figure, boolean fits) {
        misses += fits ? 0 : 1;
        return figure + (fits ? " " : "!");
    }

    private static String ratio(double ratio, boolean fits) {
        return marked(String.format(Locale.ROOT, "%.2f", ratio), fits);
    }

    private static String added(double nanoseconds) {
        String figure = String.format(Locale.ROOT, "%.1f", nanoseconds);
        return marked(figure, nanoseconds <= QUERY_LIMIT);
    }

    private byte[] read(String name) throws Exception {
        return Files.readAllBytes(folder.resolve(name));
    }

    /** Single answers, against natives that do nothing but call the virtual machine for them. */
    private void answers() throws Exception {
        byte[] message = read("547.push");
        if (!parser.qvomacp_parser(message, message.length, 0)) {
            throw new IllegalStateException("the message is refused");
        }
        String[] napDef = napDefs.qvomacp_GetPxNapDefData(1);
        String[] authentication = napDefs.qvomacp_GetPxNapAuthInfoData(1, 1);
        bare.hold(napDefs.qvomacp_GetPxBearerCount(1),
                new Object[] {napDefs.qvomacp_GetPxBearerData(1, 1), napDef, authentication});
        require(bare.number() == napDefs.qvomacp_GetPxBearerCount(1));
        require(bare.text(0).equals(napDefs.qvomacp_GetPxBearerData(1, 1)));
        require(Arrays.equals(bare.array(1), napDef));
        require(Arrays.equals(bare.array(2), authentication));

        System.out.println("Answers at index 1, against the calls of the virtual machine alone");
        row("%22s %10s %10s %12s", "", "native ns", "calls ns", "");
        double[] counts =
                compare(() -> napDefs.qvomacp_GetPxBearerCount(1), () -> bare.number());
        row("%22s %10.1f %10.1f %12s  added ns, <= %.0f", "count", counts[0], counts[1],
                added(counts[0] - counts[1]), QUERY_LIMIT);
        double[] texts =
                compare(
                        () -> napDefs.qvomacp_GetPxBearerData(1, 1).length(),
                        () -> bare.text(0).length());
        row("%22s %10.1f %10.1f %12s  added ns, <= %.0f", "text", texts[0], texts[1],
                added(texts[0] - texts[1]), QUERY_LIMIT);
        array("String[] of " + napDef.length, () -> napDefs.qvomacp_GetPxNapDefData(1).length,
                () -> bare.array(1).length);
        array("String[] of " + authentication.length,
                () -> napDefs.qvomacp_GetPxNapAuthInfoData(1, 1).length,
                () -> bare.array(2).length);
        parser.qvomacp_parser_del();
        System.out.println();
    }

    private void array(String name, Work work, Work calls) throws Exception {
        double[] times = compare(work, calls);
        double ratio = times[0] / times[1];
        row("%22s %10.1f %10.1f %12s  times, <= %.1f", name, times[0], times[1],
                ratio(ratio, ratio <= ARRAY_LIMIT), ARRAY_LIMIT);
    }

    private static void require(boolean same) {
        if (!same) {
            throw new IllegalStateException("the natives that are compared answer differently");
        }
    }

    /** A loop over all access points, whose index is walked to by each call. */
    private void loops() throws Exception {
        System.out.println("Bearers and arrays of all access points in turn");
        row("%10s %10s %14s %14s", "document", "points", "text ns", "String[] ns");
        for (String name : "547 29k 200k 1m".split(" ")) {
            byte[] message = read(name + ".push");
            if (!parser.qvomacp_parser(message, message.length, 0)) {
                throw new IllegalStateException("the message is refused");
            }
            int points = napDefs.qvomacp_GetPxNapDefCount();
            double[] times = compare(() -> texts(points), () -> arrays(points));
            row("%10s %10d %14.1f %14.1f", name, points, times[0] / points, times[1] / points);
            parser.qvomacp_parser_del();
        }
        System.out.println();
    }

    private int texts(int points) {
        int answered = 0;
        for (int n = 1; n <= points; ++n) {
            answered += napDefs.qvomacp_GetPxBearerData(n, 1) == null ? 0 : 1;
        }
        return answered;
    }

    private int arrays(int points) {
        int answered = 0;
        for (int n = 1; n <= points; ++n) {
            answered += napDefs.qvomacp_GetPxNapDefData(n).length;
        }
        return answered;
    }
}
