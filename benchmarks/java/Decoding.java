import com.sun.management.ThreadMXBean;
import java.lang.management.ManagementFactory;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import java.util.Locale;
import java.util.Random;

/**
 * Measures the reader in one virtual machine: a push to its tree, with views of all kinds and the
 * verdict, against kXML's pull of the same body, with the natives' answers beside it. All documents
 * are warmed up in mixed order, and measured so; of each the middle turn counts, in processor time.
 *
 * <p>Decoding FOLDER SECONDS takes that much processor time, and prints a line for each document: its size, the nanoseconds of each of
 * the three, and the bytes that the reader allocates. Decoding reader FILE or Decoding pull FILE
 * prints the nanoseconds of the first document in a new machine.
 */
public final class Decoding {
    private static final int TURN_NANOSECONDS = 2_000_000;
    private static final int NATIVE_TURNS = 9;

    /** What is measured. */
    private enum Side {
        READER,
        PULL,
        NATIVES
    }

    private static final List<String> DOCUMENTS =
            Arrays.asList("160", "300", "547", "2k", "8k", "29k", "200k", "1m");

    private static int sink;

    /** One side of one document, and how long its turns have taken. */
    private static final class Turns {
        final Side side;
        final byte[] bytes;
        int rounds = 1;
        final List<Double> taken = new ArrayList<>();

        Turns(Side side, byte[] bytes) {
            this.side = side;
            this.bytes = bytes;
        }

        /** Runs for two milliseconds at least, once it knows how many rounds that takes. */
        void run(ThreadMXBean threads, Queries queries) throws Exception {
            long before = threads.getCurrentThreadCpuTime();
            for (int round = 0; round < rounds; ++round) {
                sink += once(side, bytes, queries);
            }
            long time = threads.getCurrentThreadCpuTime() - before;
            taken.add((double) time / rounds);
            if (time < TURN_NANOSECONDS) {
                rounds *= 2;
            }
        }

        double middle() {
            Collections.sort(taken);
            return taken.get(taken.size() / 2);
        }
    }

    private static int once(Side side, byte[] bytes, Queries queries) throws Exception {
        switch (side) {
            case READER:
                return Views.all(bytes);
            case PULL:
                return Pull.all(bytes);
            default:
                return queries.all(bytes);
        }
    }

    public static void main(String[] arguments) throws Exception {
        if (arguments[0].equals("reader") || arguments[0].equals("pull")) {
            byte[] bytes = Files.readAllBytes(Paths.get(arguments[1]));
            long before = System.nanoTime();
            sink += arguments[0].equals("reader") ? Views.all(bytes) : Pull.all(bytes);
            System.out.println(System.nanoTime() - before);
        } else {
            System.loadLibrary("omacp");
            measure(Paths.get(arguments[0]), Double.parseDouble(arguments[1]));
        }
    }

    private static void measure(Path folder, double seconds) throws Exception {
        ThreadMXBean threads = (ThreadMXBean) ManagementFactory.getThreadMXBean();
        Queries queries = new Queries();
        List<Turns> all = new ArrayList<>();
        for (String name : DOCUMENTS) {
            for (Side side : Side.values()) {
                String kind = side == Side.PULL ? ".wbxml" : ".push";
                all.add(new Turns(side, Files.readAllBytes(folder.resolve(name + kind))));
            }
        }
        // The natives come last: at 1 MB they would take nearly all of the time.
        List<Turns> mixed = new ArrayList<>(all);
        mixed.removeIf(turns -> turns.side == Side.NATIVES);
        Random random = new Random(1);
        for (int half = 0; half < 2; ++half) {
            for (Turns turns : mixed) {
                turns.taken.clear();
            }
            long end = threads.getCurrentThreadCpuTime() + (long) (seconds * 0.5e9);
            do {
                Collections.shuffle(mixed, random);
                for (Turns turns : mixed) {
                    turns.run(threads, queries);
                }
            } while (threads.getCurrentThreadCpuTime() < end);
        }
        for (Turns turns : all) {
            while (turns.taken.size() < NATIVE_TURNS) {
                turns.run(threads, queries);
            }
        }
        for (int i = 0; i < DOCUMENTS.size(); ++i) {
            Turns reader = all.get(3 * i);
            long thread = Thread.currentThread().getId();
            long before = threads.getThreadAllocatedBytes(thread);
            sink += Views.all(reader.bytes);
            long allocated = threads.getThreadAllocatedBytes(thread) - before;
            System.out.println(
                    String.format(
                            Locale.ROOT,
                            "%s %d %.0f %.0f %.0f %d",
                            DOCUMENTS.get(i),
                            all.get(3 * i + 1).bytes.length,
                            reader.middle(),
                            all.get(3 * i + 1).middle(),
                            all.get(3 * i + 2).middle(),
                            allocated));
        }
    }
}
