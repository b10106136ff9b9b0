
entity lean is
   port ( A : in    std_logic; 
          Y : out   std_logic);
end lean;

architecture BEHAVIORAL of lean is
   signal N : std_logic;
begin
   U1 : AND2
      port map (I0=>A,
                I1=>N,
                O=>Y);
   
end BEHAVIORAL;


