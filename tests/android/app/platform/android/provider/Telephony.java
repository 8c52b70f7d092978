package android.provider;

public final class Telephony {
    private Telephony() {}

    public static final class Sms {
        private Sms() {}

        public static final class Intents {
            public static final String WAP_PUSH_RECEIVED_ACTION =
                    "android.provider.Telephony.WAP_PUSH_RECEIVED";

            private Intents() {}
        }
    }
}
